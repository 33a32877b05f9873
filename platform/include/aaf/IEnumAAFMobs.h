#pragma once
/// Walks a list of Mobs.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IEnumAAFMobs : public IUnknown {
public:
    virtual AAFRESULT NextOne(IAAFMob** ppMob) = 0;
    virtual AAFRESULT Next(aafUInt32 count, IAAFMob** ppMobs, aafUInt32* pFetched) = 0;
    virtual AAFRESULT Skip(aafUInt32 count) = 0;
    virtual AAFRESULT Reset() = 0;
    virtual AAFRESULT Clone(IEnumAAFMobs** ppEnum) = 0;

protected:
    ~IEnumAAFMobs() = default;
};
AAF_INTERFACE_ID(IEnumAAFMobs);
