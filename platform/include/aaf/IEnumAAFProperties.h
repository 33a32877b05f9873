#pragma once
/// Walks the present properties of an object.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IEnumAAFProperties : public IUnknown {
public:
    virtual AAFRESULT NextOne(IAAFProperty** ppProperty) = 0;
    virtual AAFRESULT Next(aafUInt32 count, IAAFProperty** ppProperties, aafUInt32* pFetched) = 0;
    virtual AAFRESULT Skip(aafUInt32 count) = 0;
    virtual AAFRESULT Reset() = 0;
    virtual AAFRESULT Clone(IEnumAAFProperties** ppEnum) = 0;

protected:
    ~IEnumAAFProperties() = default;
};
AAF_INTERFACE_ID(IEnumAAFProperties);
