#include "Property.h"

#include "PropertyDefinition.h"
#include "PropertyValue.h"

namespace aafmodel {

Property::Property(PropertyDefinition& def, std::shared_ptr<Value> value) : m_def(def), m_value(std::move(value)) {
    m_def.AddRef();
}

Property::~Property() { m_def.Release(); }

aafUInt32 Property::Release() {
    const aafUInt32 left = --m_refs;
    if (left == 0) delete this;
    return left;
}

AAFRESULT Property::QueryInterface(REFIID riid, void** ppvObj) {
    if (!ppvObj) return AAFRESULT_NULL_PARAM;
    if (riid != IID_IUnknown && riid != IID_IAAFProperty) {
        *ppvObj = nullptr;
        return AAF_E_NOINTERFACE;
    }
    *ppvObj = static_cast<IAAFProperty*>(this);
    AddRef();
    return AAFRESULT_SUCCESS;
}

AAFRESULT Property::GetDefinition(IAAFPropertyDef** ppPropDef) {
    if (!ppPropDef) return AAFRESULT_NULL_PARAM;
    *ppPropDef = &m_def;
    m_def.AddRef();
    return AAFRESULT_SUCCESS;
}

AAFRESULT Property::GetValue(IAAFPropertyValue** ppValue) {
    if (!ppValue) return AAFRESULT_NULL_PARAM;
    *ppValue = PropertyValue::Make(m_value);
    return AAFRESULT_SUCCESS;
}

}  // namespace aafmodel
