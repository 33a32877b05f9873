#include "PropertyDefinition.h"

#include "InternalIDs.h"
#include "Schema.h"
#include "TypeDefinition.h"

namespace aafmodel {

PropertyDefinition::PropertyDefinition(Schema& schema, const aafUID_t& id, std::wstring name, TypeDefinition& type,
                                       bool optional, ClassDefinition& owner)
    : MetaDefinitionBase(schema, id, std::move(name)),
      m_type(type),
      m_optional(optional),
      m_owner(owner),
      m_serial(schema.NextPropertySerial()) {}

AAFRESULT PropertyDefinition::QueryInterface(REFIID riid, void** ppvObj) {
    if (!ppvObj) return AAFRESULT_NULL_PARAM;
    if (riid == IID_IUnknown || riid == IID_IAAFPropertyDef)
        *ppvObj = static_cast<IAAFPropertyDef*>(this);
    else if (riid == IID_IAAFMetaDefinition)
        *ppvObj = static_cast<IAAFMetaDefinition*>(this);
    else if (riid == kInternal_PropertyDefinition)
        *ppvObj = this;
    else {
        *ppvObj = nullptr;
        return AAF_E_NOINTERFACE;
    }
    AddRef();
    return AAFRESULT_SUCCESS;
}

AAFRESULT PropertyDefinition::GetTypeDef(IAAFTypeDef** ppTypeDef) {
    if (!ppTypeDef) return AAFRESULT_NULL_PARAM;
    *ppTypeDef = m_type.Interface();
    (*ppTypeDef)->AddRef();
    return AAFRESULT_SUCCESS;
}

AAFRESULT PropertyDefinition::GetIsOptional(aafBool* pIsOptional) {
    if (!pIsOptional) return AAFRESULT_NULL_PARAM;
    *pIsOptional = m_optional ? kAAFTrue : kAAFFalse;
    return AAFRESULT_SUCCESS;
}

AAFRESULT PropertyDefinition::GetIsUniqueIdentifier(aafBool* pIsUniqueIdentifier) {
    if (!pIsUniqueIdentifier) return AAFRESULT_NULL_PARAM;
    *pIsUniqueIdentifier = kAAFFalse;
    return AAFRESULT_SUCCESS;
}

}  // namespace aafmodel
