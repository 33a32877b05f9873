#pragma once
/// Walks the elements of an array value.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IEnumAAFPropertyValues : public IUnknown {
public:
    virtual AAFRESULT NextOne(IAAFPropertyValue** ppPropertyValue) = 0;
    virtual AAFRESULT Next(aafUInt32 count, IAAFPropertyValue** ppPropertyValues, aafUInt32* pFetched) = 0;
    virtual AAFRESULT Skip(aafUInt32 count) = 0;
    virtual AAFRESULT Reset() = 0;
    virtual AAFRESULT Clone(IEnumAAFPropertyValues** ppEnum) = 0;

protected:
    ~IEnumAAFPropertyValues() = default;
};
AAF_INTERFACE_ID(IEnumAAFPropertyValues);
