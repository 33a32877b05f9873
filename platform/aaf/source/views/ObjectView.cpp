#include "ObjectView.h"

#include "../core/ClassDefinition.h"
#include "../core/Enumerator.h"
#include "../core/InternalIDs.h"
#include "../core/Property.h"
#include "../core/PropertyDefinition.h"
#include "../core/PropertyValue.h"
#include "../core/Schema.h"
#include "../core/TypeDefinition.h"
#include "ViewSupport.h"
#include "aaf/IEnumAAFProperties.h"

namespace aafmodel {

namespace {
// A property definition of the object's class (or an ancestor's).
PropertyDefinition& PropertyArg(const ModelObject& object, IAAFPropertyDef* pPropDef) {
    PropertyDefinition* def = Borrow<PropertyDefinition>(pPropDef, kInternal_PropertyDefinition);
    Require(def);
    if (!object.Class().HasProperty(*def)) throw static_cast<int>(AAFRESULT_PROPERTY_NOT_FOUND);
    return *def;
}
}  // namespace

// Generations are not tracked: objects carry no generation of their own.
AAFRESULT ObjectView::SetGeneration(aafUID_constref) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT ObjectView::GetGeneration(IAAFIdentification**) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT ObjectView::GetGenerationAUID(aafUID_t*) { return AAFRESULT_NOT_IMPLEMENTED; }

AAFRESULT ObjectView::GetDefinition(IAAFClassDef** ppClassDef) {
    if (!ppClassDef) return AAFRESULT_NULL_PARAM;
    *ppClassDef = &m_object.Class();
    (*ppClassDef)->AddRef();
    return AAFRESULT_SUCCESS;
}

AAFRESULT ObjectView::GetProperties(IEnumAAFProperties** ppEnum) {
    return Guarded([&] {
        Require(ppEnum);
        std::vector<RefPtr<IAAFProperty>> items;
        for (const auto& stored : m_object.Properties()) items.emplace_back(new Property(*stored.def, stored.value));
        *ppEnum = new Enumerator<IEnumAAFProperties, IAAFProperty>(std::move(items));
        (*ppEnum)->AddRef();
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT ObjectView::CountProperties(aafUInt32* pCount) {
    if (!pCount) return AAFRESULT_NULL_PARAM;
    *pCount = static_cast<aafUInt32>(m_object.Properties().size());
    return AAFRESULT_SUCCESS;
}

AAFRESULT ObjectView::GetPropertyValue(IAAFPropertyDef* pPropDef, IAAFPropertyValue** ppPropVal) {
    return Guarded([&] {
        Require(ppPropVal);
        auto value = m_object.FindShared(PropertyArg(m_object, pPropDef));
        Require(value, AAFRESULT_PROP_NOT_PRESENT);
        *ppPropVal = PropertyValue::Make(value);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT ObjectView::SetPropertyValue(IAAFPropertyDef* pPropDef, IAAFPropertyValue* pPropVal) {
    return Guarded([&] {
        PropertyDefinition& def = PropertyArg(m_object, pPropDef);
        m_object.Assign(def, def.Type().ValueOf(pPropVal));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT ObjectView::IsPropertyPresent(IAAFPropertyDef* pPropDef, aafBool* pResult) {
    return Guarded([&] {
        Require(pResult);
        *pResult = m_object.Find(PropertyArg(m_object, pPropDef)) ? kAAFTrue : kAAFFalse;
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT ObjectView::RemoveOptionalProperty(IAAFPropertyDef* pPropDef) {
    return Guarded([&] {
        PropertyDefinition& def = PropertyArg(m_object, pPropDef);
        if (!def.Optional()) throw static_cast<int>(AAFRESULT_ILLEGAL_VALUE);
        if (!m_object.Find(def)) throw static_cast<int>(AAFRESULT_PROP_NOT_PRESENT);
        m_object.Remove(def);
        return AAFRESULT_SUCCESS;
    });
}

// The property becomes present, empty, and the value returned shares it.
AAFRESULT ObjectView::CreateOptionalPropertyValue(IAAFPropertyDef* pPropDef, IAAFPropertyValue** ppPropVal) {
    return Guarded([&] {
        Require(ppPropVal);
        PropertyDefinition& def = PropertyArg(m_object, pPropDef);
        if (!def.Optional()) throw static_cast<int>(AAFRESULT_ILLEGAL_VALUE);
        *ppPropVal = PropertyValue::Make(m_object.Ensure(def));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT ObjectView::GetDictionary(IAAFDictionary** ppDictionary) {
    return Guarded([&] {
        Require(ppDictionary);
        ModelObject* top = &m_object;
        while (top->Container()) top = top->Container();
        // Only objects inside a file's tree know their dictionary.
        const BuiltinDefinitions& b = Builtins(m_object);
        ModelObject* dictionary = top->Class().IsA(*b.c.header) ? top->GetRef(*b.p.headerDictionary) : nullptr;
        Require(dictionary, AAFRESULT_OBJECT_NOT_ATTACHED);
        return HandOut(*dictionary, ppDictionary);
    });
}

AAFRESULT ObjectView::EnableGenerationTracking() { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT ObjectView::DisableGenerationTracking() { return AAFRESULT_SUCCESS; }
AAFRESULT ObjectView::IsGenerationTracked(aafBool* pResult) {
    if (!pResult) return AAFRESULT_NULL_PARAM;
    *pResult = kAAFFalse;
    return AAFRESULT_SUCCESS;
}

}  // namespace aafmodel
