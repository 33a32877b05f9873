#pragma once
/// The sample rate and length of a file descriptor.
#include "../core/ViewBase.h"
#include "aaf/IAAFFileDescriptor.h"

namespace aafmodel {

class FileDescriptorView final : public View<IAAFFileDescriptor> {
public:
    using View::View;

    AAFRESULT SetLength(aafLength_t length) override;
    AAFRESULT GetLength(aafLength_t* pLength) override;
    AAFRESULT SetCodecDef(IAAFCodecDef* pDef) override;
    AAFRESULT GetCodecDef(IAAFCodecDef** ppDef) override;
    AAFRESULT SetSampleRate(aafRational_constref rate) override;
    AAFRESULT GetSampleRate(aafRational_t* pRate) override;
    AAFRESULT SetContainerFormat(IAAFContainerDef* pFormat) override;
    AAFRESULT GetContainerFormat(IAAFContainerDef** ppFormat) override;
};

}  // namespace aafmodel
