#include "EssenceDescriptorView.h"

#include "../core/Enumerator.h"
#include "../core/Schema.h"
#include "ViewSupport.h"
#include "aaf/IAAFLocator.h"
#include "aaf/IEnumAAFLocators.h"

namespace aafmodel {

AAFRESULT EssenceDescriptorView::CountLocators(aafUInt32* pResult) {
    if (!pResult) return AAFRESULT_NULL_PARAM;
    const auto* locators = m_object.FindVector(*Builtins(m_object).p.essenceLocator);
    *pResult = locators ? static_cast<aafUInt32>(locators->size()) : 0;
    return AAFRESULT_SUCCESS;
}

AAFRESULT EssenceDescriptorView::AppendLocator(IAAFLocator* pLocator) {
    aafUInt32 count = 0;
    CountLocators(&count);
    return InsertLocatorAt(count, pLocator);
}

AAFRESULT EssenceDescriptorView::PrependLocator(IAAFLocator* pLocator) { return InsertLocatorAt(0, pLocator); }

AAFRESULT EssenceDescriptorView::InsertLocatorAt(aafUInt32 index, IAAFLocator* pLocator) {
    return Guarded([&] {
        const BuiltinDefinitions& b = Builtins(m_object);
        m_object.InsertInto(*b.p.essenceLocator, index, ObjectArg(pLocator, *b.c.locator));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT EssenceDescriptorView::GetLocatorAt(aafUInt32 index, IAAFLocator** ppLocator) {
    return Guarded([&] {
        const auto* locators = m_object.FindVector(*Builtins(m_object).p.essenceLocator);
        if (!locators || index >= locators->size()) throw static_cast<int>(AAFRESULT_BADINDEX);
        return HandOut(*(*locators)[index], ppLocator);
    });
}

AAFRESULT EssenceDescriptorView::RemoveLocatorAt(aafUInt32 index) {
    return Guarded([&] {
        m_object.RemoveFrom(*Builtins(m_object).p.essenceLocator, index);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT EssenceDescriptorView::GetLocators(IEnumAAFLocators** ppEnum) {
    return Guarded([&] {
        Require(ppEnum);
        std::vector<RefPtr<IAAFLocator>> items;
        if (const auto* locators = m_object.FindVector(*Builtins(m_object).p.essenceLocator))
            for (const auto& l : *locators) items.push_back(l->Query<IAAFLocator>());
        *ppEnum = new Enumerator<IEnumAAFLocators, IAAFLocator>(std::move(items));
        (*ppEnum)->AddRef();
        return AAFRESULT_SUCCESS;
    });
}

}  // namespace aafmodel
