#pragma once
/// The locators of an essence descriptor.
#include "../core/ViewBase.h"
#include "aaf/IAAFEssenceDescriptor.h"

namespace aafmodel {

class EssenceDescriptorView final : public View<IAAFEssenceDescriptor> {
public:
    using View::View;

    AAFRESULT CountLocators(aafUInt32* pResult) override;
    AAFRESULT AppendLocator(IAAFLocator* pLocator) override;
    AAFRESULT PrependLocator(IAAFLocator* pLocator) override;
    AAFRESULT InsertLocatorAt(aafUInt32 index, IAAFLocator* pLocator) override;
    AAFRESULT GetLocatorAt(aafUInt32 index, IAAFLocator** ppLocator) override;
    AAFRESULT RemoveLocatorAt(aafUInt32 index) override;
    AAFRESULT GetLocators(IEnumAAFLocators** ppEnum) override;
};

}  // namespace aafmodel
