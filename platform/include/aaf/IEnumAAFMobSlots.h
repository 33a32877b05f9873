#pragma once
/// Walks the slots of a Mob.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IEnumAAFMobSlots : public IUnknown {
public:
    virtual AAFRESULT NextOne(IAAFMobSlot** ppMobSlot) = 0;
    virtual AAFRESULT Next(aafUInt32 count, IAAFMobSlot** ppMobSlots, aafUInt32* pFetched) = 0;
    virtual AAFRESULT Skip(aafUInt32 count) = 0;
    virtual AAFRESULT Reset() = 0;
    virtual AAFRESULT Clone(IEnumAAFMobSlots** ppEnum) = 0;

protected:
    ~IEnumAAFMobSlots() = default;
};
AAF_INTERFACE_ID(IEnumAAFMobSlots);
