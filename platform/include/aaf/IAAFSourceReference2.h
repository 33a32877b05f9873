#pragma once
/// A source reference that names channels of a multi-channel source.
#include "aaf/IAAFSourceReference.h"

class IAAFSourceReference2 : public IAAFSourceReference {
public:
    virtual AAFRESULT SetChannelIDs(aafUInt32 numberElements, aafUInt32* pChannelIDs) = 0;
    virtual AAFRESULT GetChannelIDs(aafUInt32 numberElements, aafUInt32* pChannelIDs) = 0;
    virtual AAFRESULT GetChannelIDsSize(aafUInt32* numberElements) = 0;
    virtual AAFRESULT SetMonoSourceSlotIDs(aafUInt32 numberElements, aafUInt32* pMonoSourceSlotIDs) = 0;
    virtual AAFRESULT GetMonoSourceSlotIDs(aafUInt32 numberElements, aafUInt32* pMonoSourceSlotIDs) = 0;
    virtual AAFRESULT GetMonoSourceSlotIDsSize(aafUInt32* numberElements) = 0;

protected:
    ~IAAFSourceReference2() = default;
};
AAF_INTERFACE_ID(IAAFSourceReference2);
