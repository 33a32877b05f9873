#pragma once
/// A descriptor made of file descriptors, one per track of the essence.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFMultipleDescriptor : public IUnknown {
public:
    virtual AAFRESULT Initialize() = 0;
    virtual AAFRESULT CountFileDescriptors(aafUInt32* pResult) = 0;
    virtual AAFRESULT AppendFileDescriptor(IAAFFileDescriptor* pFileDescriptor) = 0;
    virtual AAFRESULT PrependFileDescriptor(IAAFFileDescriptor* pFileDescriptor) = 0;
    virtual AAFRESULT InsertFileDescriptorAt(aafUInt32 index, IAAFFileDescriptor* pFileDescriptor) = 0;
    virtual AAFRESULT GetFileDescriptorAt(aafUInt32 index, IAAFFileDescriptor** ppFileDescriptor) = 0;
    virtual AAFRESULT RemoveFileDescriptorAt(aafUInt32 index) = 0;
    virtual AAFRESULT GetFileDescriptors(IEnumAAFFileDescriptors** ppEnum) = 0;

protected:
    ~IAAFMultipleDescriptor() = default;
};
AAF_INTERFACE_ID(IAAFMultipleDescriptor);
