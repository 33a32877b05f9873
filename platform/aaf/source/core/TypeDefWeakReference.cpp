#include "TypeDefWeakReference.h"

#include <cstring>

#include "ClassDefinition.h"
#include "DataDefinition.h"
#include "Schema.h"

namespace aafmodel {

namespace {
// Only data definitions are targets of weak references in this model.
DataDefinition& TargetOf(IUnknown* pObject) {
    DataDefinition* def = Borrow<DataDefinition>(pObject, kInternal_DataDefinition);
    if (!def) throw static_cast<int>(pObject ? AAFRESULT_BAD_TYPE : AAFRESULT_NULL_PARAM);
    return *def;
}
}  // namespace

TypeDefWeakReference::TypeDefWeakReference(Schema& schema, const aafUID_t& id, std::wstring name,
                                           ClassDefinition* target)
    : TypeDefFace(schema, id, std::move(name), kAAFTypeCatWeakObjRef), m_target(target) {}

AAFRESULT TypeDefWeakReference::Initialize(aafUID_constref, IAAFClassDef*, aafCharacter_constptr, aafUInt32,
                                           aafUID_constptr) {
    return AAFRESULT_NOT_IMPLEMENTED;
}

AAFRESULT TypeDefWeakReference::GetObjectType(IAAFClassDef** ppObjType) {
    if (!ppObjType) return AAFRESULT_NULL_PARAM;
    *ppObjType = m_target;
    m_target->AddRef();
    return AAFRESULT_SUCCESS;
}

AAFRESULT TypeDefWeakReference::CreateValue(IUnknown* pObj, IAAFPropertyValue** ppPropVal) {
    return Guarded([&] {
        Require(ppPropVal);
        Value value = EmptyValue();
        std::memcpy(value.data.data(), &TargetOf(pObj).Id(), sizeof(aafUID_t));
        *ppPropVal = NewValue(std::move(value));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefWeakReference::GetObject(IAAFPropertyValue* pPropVal, REFIID iid, IUnknown** ppObject) {
    return Guarded([&] {
        Require(ppObject);
        const Value& value = ValueOf(pPropVal);
        if (value.data.size() != sizeof(aafUID_t)) throw static_cast<int>(AAFRESULT_PROP_NOT_PRESENT);
        aafUID_t id;
        std::memcpy(&id, value.data.data(), sizeof id);
        DataDefinition* def = GetSchema().FindDataDef(id);
        Require(def, AAFRESULT_OBJECT_NOT_FOUND);
        return def->QueryInterface(iid, reinterpret_cast<void**>(ppObject));
    });
}

AAFRESULT TypeDefWeakReference::SetObject(IAAFPropertyValue* pPropVal, IUnknown* pObject) {
    return Guarded([&] {
        Value& value = ValueOf(pPropVal);
        value.data.resize(sizeof(aafUID_t));
        std::memcpy(value.data.data(), &TargetOf(pObject).Id(), sizeof(aafUID_t));
        return AAFRESULT_SUCCESS;
    });
}

}  // namespace aafmodel
