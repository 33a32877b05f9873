#pragma once
/// Walks the locators of a descriptor.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IEnumAAFLocators : public IUnknown {
public:
    virtual AAFRESULT NextOne(IAAFLocator** ppLocator) = 0;
    virtual AAFRESULT Next(aafUInt32 count, IAAFLocator** ppLocators, aafUInt32* pFetched) = 0;
    virtual AAFRESULT Skip(aafUInt32 count) = 0;
    virtual AAFRESULT Reset() = 0;
    virtual AAFRESULT Clone(IEnumAAFLocators** ppEnum) = 0;

protected:
    ~IEnumAAFLocators() = default;
};
AAF_INTERFACE_ID(IEnumAAFLocators);
