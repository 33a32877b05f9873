#include "PropertyValue.h"

#include "InternalIDs.h"
#include "Schema.h"
#include "TypeDefinition.h"

namespace aafmodel {

PropertyValue::PropertyValue(std::shared_ptr<Value> value, Schema& schema)
    : m_schema(&schema), m_value(std::move(value)) {}

IAAFPropertyValue* PropertyValue::Make(std::shared_ptr<Value> value) {
    auto* made = new PropertyValue(value, value->type->GetSchema());
    made->AddRef();
    return made;
}

aafUInt32 PropertyValue::Release() {
    const aafUInt32 left = --m_refs;
    if (left == 0) delete this;
    return left;
}

AAFRESULT PropertyValue::QueryInterface(REFIID riid, void** ppvObj) {
    if (!ppvObj) return AAFRESULT_NULL_PARAM;
    if (riid == IID_IUnknown || riid == IID_IAAFPropertyValue)
        *ppvObj = static_cast<IAAFPropertyValue*>(this);
    else if (riid == kInternal_PropertyValue)
        *ppvObj = this;
    else {
        *ppvObj = nullptr;
        return AAF_E_NOINTERFACE;
    }
    AddRef();
    return AAFRESULT_SUCCESS;
}

AAFRESULT PropertyValue::GetType(IAAFTypeDef** ppTypeDef) {
    if (!ppTypeDef) return AAFRESULT_NULL_PARAM;
    *ppTypeDef = m_value->type->Interface();
    (*ppTypeDef)->AddRef();
    return AAFRESULT_SUCCESS;
}

AAFRESULT PropertyValue::IsDefinedType(aafBool* pIsDefined) {
    if (!pIsDefined) return AAFRESULT_NULL_PARAM;
    *pIsDefined = kAAFTrue;
    return AAFRESULT_SUCCESS;
}

}  // namespace aafmodel
