#pragma once
/// The file descriptors of a multiple descriptor.
#include "../core/ViewBase.h"
#include "aaf/IAAFMultipleDescriptor.h"

namespace aafmodel {

class MultipleDescriptorView final : public View<IAAFMultipleDescriptor> {
public:
    using View::View;

    AAFRESULT Initialize() override;
    AAFRESULT CountFileDescriptors(aafUInt32* pResult) override;
    AAFRESULT AppendFileDescriptor(IAAFFileDescriptor* pFileDescriptor) override;
    AAFRESULT PrependFileDescriptor(IAAFFileDescriptor* pFileDescriptor) override;
    AAFRESULT InsertFileDescriptorAt(aafUInt32 index, IAAFFileDescriptor* pFileDescriptor) override;
    AAFRESULT GetFileDescriptorAt(aafUInt32 index, IAAFFileDescriptor** ppFileDescriptor) override;
    AAFRESULT RemoveFileDescriptorAt(aafUInt32 index) override;
    AAFRESULT GetFileDescriptors(IEnumAAFFileDescriptors** ppEnum) override;
};

}  // namespace aafmodel
