#pragma once
/// Describes essence; holds its locators.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFEssenceDescriptor : public IUnknown {
public:
    virtual AAFRESULT CountLocators(aafUInt32* pResult) = 0;
    virtual AAFRESULT AppendLocator(IAAFLocator* pLocator) = 0;
    virtual AAFRESULT PrependLocator(IAAFLocator* pLocator) = 0;
    virtual AAFRESULT InsertLocatorAt(aafUInt32 index, IAAFLocator* pLocator) = 0;
    virtual AAFRESULT GetLocatorAt(aafUInt32 index, IAAFLocator** ppLocator) = 0;
    virtual AAFRESULT RemoveLocatorAt(aafUInt32 index) = 0;
    virtual AAFRESULT GetLocators(IEnumAAFLocators** ppEnum) = 0;

protected:
    ~IAAFEssenceDescriptor() = default;
};
AAF_INTERFACE_ID(IAAFEssenceDescriptor);
