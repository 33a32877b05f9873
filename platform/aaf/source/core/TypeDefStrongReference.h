#pragma once
/// A strong reference: the value owns one object of the target class.
#include "TypeDefFace.h"
#include "aaf/IAAFTypeDefStrongObjRef.h"

namespace aafmodel {

class ClassDefinition;

class TypeDefStrongReference final : public TypeDefFace<IAAFTypeDefStrongObjRef, IAAFTypeDefObjectRef> {
public:
    TypeDefStrongReference(Schema& schema, const aafUID_t& id, std::wstring name, ClassDefinition* target);

    bool HoldsObjects() const override { return true; }
    /// The library object behind `pObject`, checked against the target class.
    ModelObject& Target(IUnknown* pObject) const;

    using MetaDefinitionBase::Initialize;
    AAFRESULT Initialize(aafUID_constref id, IAAFClassDef* pObjType, aafCharacter_constptr pTypeName) override;
    AAFRESULT GetObjectType(IAAFClassDef** ppObjType) override;
    AAFRESULT CreateValue(IUnknown* pObj, IAAFPropertyValue** ppPropVal) override;
    AAFRESULT GetObject(IAAFPropertyValue* pPropVal, REFIID iid, IUnknown** ppObject) override;
    AAFRESULT SetObject(IAAFPropertyValue* pPropVal, IUnknown* pObject) override;

private:
    ClassDefinition* m_target;
};

}  // namespace aafmodel
