#pragma once
/// Walks the file descriptors of a multiple descriptor.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IEnumAAFFileDescriptors : public IUnknown {
public:
    virtual AAFRESULT NextOne(IAAFFileDescriptor** ppFileDescriptor) = 0;
    virtual AAFRESULT Next(aafUInt32 count, IAAFFileDescriptor** ppFileDescriptors, aafUInt32* pFetched) = 0;
    virtual AAFRESULT Skip(aafUInt32 count) = 0;
    virtual AAFRESULT Reset() = 0;
    virtual AAFRESULT Clone(IEnumAAFFileDescriptors** ppEnum) = 0;

protected:
    ~IEnumAAFFileDescriptors() = default;
};
AAF_INTERFACE_ID(IEnumAAFFileDescriptors);
