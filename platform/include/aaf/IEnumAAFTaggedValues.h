#pragma once
/// Walks comments or attributes.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IEnumAAFTaggedValues : public IUnknown {
public:
    virtual AAFRESULT NextOne(IAAFTaggedValue** ppTaggedValue) = 0;
    virtual AAFRESULT Next(aafUInt32 count, IAAFTaggedValue** ppTaggedValues, aafUInt32* pFetched) = 0;
    virtual AAFRESULT Skip(aafUInt32 count) = 0;
    virtual AAFRESULT Reset() = 0;
    virtual AAFRESULT Clone(IEnumAAFTaggedValues** ppEnum) = 0;

protected:
    ~IEnumAAFTaggedValues() = default;
};
AAF_INTERFACE_ID(IEnumAAFTaggedValues);
