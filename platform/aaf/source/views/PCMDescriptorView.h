#pragma once
/// The properties of a PCM descriptor.
#include "../core/ViewBase.h"
#include "aaf/IAAFPCMDescriptor.h"

namespace aafmodel {

class PCMDescriptorView final : public View<IAAFPCMDescriptor> {
public:
    using View::View;

    AAFRESULT Initialize() override;
    AAFRESULT SetBlockAlign(aafUInt16 blockAlign) override;
    AAFRESULT GetBlockAlign(aafUInt16* pBlockAlign) override;
    AAFRESULT SetSequenceOffset(aafUInt8 offset) override;
    AAFRESULT GetSequenceOffset(aafUInt8* pOffset) override;
    AAFRESULT SetAverageBPS(aafUInt32 bps) override;
    AAFRESULT GetAverageBPS(aafUInt32* pBps) override;
};

}  // namespace aafmodel
