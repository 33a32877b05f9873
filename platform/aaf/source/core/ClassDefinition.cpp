#include "ClassDefinition.h"

#include "Enumerator.h"
#include "Guard.h"
#include "InternalIDs.h"
#include "ModelObject.h"
#include "PropertyDefinition.h"
#include "Schema.h"
#include "TypeDefinition.h"
#include "aaf/IEnumAAFPropertyDefs.h"

namespace aafmodel {

ClassDefinition::ClassDefinition(Schema& schema, const aafUID_t& id, std::wstring name, ClassDefinition* parent,
                                 bool concrete)
    : MetaDefinitionBase(schema, id, std::move(name)), m_parent(parent), m_concrete(concrete) {}

bool ClassDefinition::IsA(const ClassDefinition& other) const {
    for (const ClassDefinition* c = this; c; c = c->m_parent)
        if (c == &other) return true;
    return false;
}

PropertyDefinition* ClassDefinition::FindProperty(const aafUID_t& id) const {
    for (const ClassDefinition* c = this; c; c = c->m_parent)
        for (PropertyDefinition* p : c->m_properties)
            if (p->Id() == id) return p;
    return nullptr;
}

bool ClassDefinition::HasProperty(const PropertyDefinition& def) const {
    for (const ClassDefinition* c = this; c; c = c->m_parent)
        if (&def.Owner() == c) return true;
    return false;
}

PropertyDefinition* ClassDefinition::AddProperty(const aafUID_t& id, const std::wstring& name, TypeDefinition& type,
                                                 bool optional) {
    if (FindProperty(id)) throw static_cast<int>(AAFRESULT_TABLE_DUP_KEY);
    PropertyDefinition* def =
        m_schema.Own(std::make_unique<PropertyDefinition>(m_schema, id, name, type, optional, *this));
    m_properties.push_back(def);
    return def;
}

AAFRESULT ClassDefinition::QueryInterface(REFIID riid, void** ppvObj) {
    if (!ppvObj) return AAFRESULT_NULL_PARAM;
    if (riid == IID_IUnknown || riid == IID_IAAFClassDef)
        *ppvObj = static_cast<IAAFClassDef*>(this);
    else if (riid == IID_IAAFMetaDefinition)
        *ppvObj = static_cast<IAAFMetaDefinition*>(this);
    else if (riid == kInternal_ClassDefinition)
        *ppvObj = this;
    else {
        *ppvObj = nullptr;
        return AAF_E_NOINTERFACE;
    }
    AddRef();
    return AAFRESULT_SUCCESS;
}

AAFRESULT ClassDefinition::Initialize(aafUID_constref classID, IAAFClassDef* pParentClass,
                                      aafCharacter_constptr pClassName, aafBool isConcrete) {
    return Guarded([&] {
        ClassDefinition* parent = Borrow<ClassDefinition>(pParentClass, kInternal_ClassDefinition);
        Require(parent);
        Define(classID, pClassName);
        m_parent = parent;
        m_concrete = isConcrete != kAAFFalse;
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT ClassDefinition::GetPropertyDefs(IEnumAAFPropertyDefs** ppEnum) {
    return Guarded([&] {
        Require(ppEnum);
        std::vector<RefPtr<IAAFPropertyDef>> defs;
        for (PropertyDefinition* p : m_properties) defs.emplace_back(p);
        *ppEnum = new Enumerator<IEnumAAFPropertyDefs, IAAFPropertyDef>(std::move(defs));
        (*ppEnum)->AddRef();
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT ClassDefinition::CountPropertyDefs(aafUInt32* pCount) {
    if (!pCount) return AAFRESULT_NULL_PARAM;
    *pCount = static_cast<aafUInt32>(m_properties.size());
    return AAFRESULT_SUCCESS;
}

AAFRESULT ClassDefinition::RegisterNewPropertyDef(aafUID_constref id, aafCharacter_constptr pName,
                                                  IAAFTypeDef* pTypeDef, aafBool isOptional, aafBool,
                                                  IAAFPropertyDef** ppPropDef) {
    return Guarded([&] {
        Require(pName);
        Require(ppPropDef);
        TypeDefinition* type = Borrow<TypeDefinition>(pTypeDef, kInternal_TypeDefinition);
        Require(type);
        // A class that already has instances may only gain optional properties.
        PropertyDefinition* def = AddProperty(id, pName, *type, isOptional != kAAFFalse);
        *ppPropDef = def;
        def->AddRef();
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT ClassDefinition::RegisterOptionalPropertyDef(aafUID_constref id, aafCharacter_constptr pName,
                                                       IAAFTypeDef* pTypeDef, IAAFPropertyDef** ppPropDef) {
    return RegisterNewPropertyDef(id, pName, pTypeDef, kAAFTrue, kAAFFalse, ppPropDef);
}

AAFRESULT ClassDefinition::LookupPropertyDef(aafUID_constref propID, IAAFPropertyDef** ppPropDef) {
    if (!ppPropDef) return AAFRESULT_NULL_PARAM;
    PropertyDefinition* def = FindProperty(propID);
    if (!def) return AAFRESULT_PROPERTY_NOT_FOUND;
    *ppPropDef = def;
    def->AddRef();
    return AAFRESULT_SUCCESS;
}

AAFRESULT ClassDefinition::GetParent(IAAFClassDef** ppClassDef) {
    if (!ppClassDef) return AAFRESULT_NULL_PARAM;
    // The root class is its own parent, as the published model has it.
    ClassDefinition* parent = m_parent ? m_parent : this;
    *ppClassDef = parent;
    parent->AddRef();
    return AAFRESULT_SUCCESS;
}

AAFRESULT ClassDefinition::IsConcrete(aafBool* pResult) {
    if (!pResult) return AAFRESULT_NULL_PARAM;
    *pResult = m_concrete ? kAAFTrue : kAAFFalse;
    return AAFRESULT_SUCCESS;
}

AAFRESULT ClassDefinition::IsRoot(aafBool* pIsRoot) {
    if (!pIsRoot) return AAFRESULT_NULL_PARAM;
    *pIsRoot = m_parent ? kAAFFalse : kAAFTrue;
    return AAFRESULT_SUCCESS;
}

AAFRESULT ClassDefinition::IsUniquelyIdentified(aafBool* pIsUniquelyIdentified) {
    if (!pIsUniquelyIdentified) return AAFRESULT_NULL_PARAM;
    *pIsUniquelyIdentified = kAAFFalse;
    return AAFRESULT_SUCCESS;
}

AAFRESULT ClassDefinition::GetUniqueIdentifier(IAAFPropertyDef**) { return AAFRESULT_NOT_IMPLEMENTED; }

AAFRESULT ClassDefinition::CreateInstance(REFIID riid, IUnknown** ppvObject) {
    return Guarded([&] {
        Require(ppvObject);
        *ppvObject = nullptr;
        if (!Defined()) throw static_cast<int>(AAFRESULT_NOT_INITIALIZED);
        // Abstract classes have no instances of their own.
        if (!m_concrete) throw static_cast<int>(AAFRESULT_INVALID_PARAM);
        RefPtr<ModelObject> object(new ModelObject(*this));
        return object->QueryInterface(riid, reinterpret_cast<void**>(ppvObject));
    });
}

}  // namespace aafmodel
