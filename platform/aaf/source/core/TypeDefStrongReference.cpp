#include "TypeDefStrongReference.h"

#include "ClassDefinition.h"
#include "ModelObject.h"

namespace aafmodel {

TypeDefStrongReference::TypeDefStrongReference(Schema& schema, const aafUID_t& id, std::wstring name,
                                               ClassDefinition* target)
    : TypeDefFace(schema, id, std::move(name), kAAFTypeCatStrongObjRef), m_target(target) {}

ModelObject& TypeDefStrongReference::Target(IUnknown* pObject) const {
    ModelObject* object = ModelObject::From(pObject);
    Require(object);
    if (!m_target || !object->Class().IsA(*m_target)) throw static_cast<int>(AAFRESULT_BAD_TYPE);
    return *object;
}

AAFRESULT TypeDefStrongReference::Initialize(aafUID_constref id, IAAFClassDef* pObjType,
                                             aafCharacter_constptr pTypeName) {
    return Guarded([&] {
        ClassDefinition* target = Borrow<ClassDefinition>(pObjType, kInternal_ClassDefinition);
        Require(target);
        Define(id, pTypeName);
        m_target = target;
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefStrongReference::GetObjectType(IAAFClassDef** ppObjType) {
    if (!ppObjType) return AAFRESULT_NULL_PARAM;
    if (!m_target) return AAFRESULT_NOT_INITIALIZED;
    *ppObjType = m_target;
    m_target->AddRef();
    return AAFRESULT_SUCCESS;
}

AAFRESULT TypeDefStrongReference::CreateValue(IUnknown* pObj, IAAFPropertyValue** ppPropVal) {
    return Guarded([&] {
        Require(ppPropVal);
        Value value;
        value.objects.emplace_back(&Target(pObj));
        *ppPropVal = NewValue(std::move(value));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefStrongReference::GetObject(IAAFPropertyValue* pPropVal, REFIID iid, IUnknown** ppObject) {
    return Guarded([&] {
        Require(ppObject);
        const Value& value = ValueOf(pPropVal);
        Require(!value.objects.empty(), AAFRESULT_PROP_NOT_PRESENT);
        return value.objects.front()->QueryInterface(iid, reinterpret_cast<void**>(ppObject));
    });
}

AAFRESULT TypeDefStrongReference::SetObject(IAAFPropertyValue* pPropVal, IUnknown* pObject) {
    return Guarded([&] {
        Value& value = ValueOf(pPropVal);
        ModelObject& object = Target(pObject);
        if (!value.objects.empty() && value.objects.front().get() == &object) return AAFRESULT_SUCCESS;
        ModelObject::AttachThrough(value, object);
        for (auto& old : value.objects) ModelObject::DetachThrough(value, *old);
        value.objects.assign(1, RefPtr<ModelObject>(&object));
        return AAFRESULT_SUCCESS;
    });
}

}  // namespace aafmodel
