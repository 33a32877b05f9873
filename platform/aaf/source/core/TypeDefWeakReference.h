#pragma once
/// A weak reference: the value holds the identifier of a definition that the
/// dictionary keeps (a component's data definition), and resolves it there.
#include "TypeDefFace.h"
#include "aaf/IAAFTypeDefWeakObjRef.h"

namespace aafmodel {

class ClassDefinition;

class TypeDefWeakReference final : public TypeDefFace<IAAFTypeDefWeakObjRef, IAAFTypeDefObjectRef> {
public:
    TypeDefWeakReference(Schema& schema, const aafUID_t& id, std::wstring name, ClassDefinition* target);

    size_t NativeSize() const override { return sizeof(aafUID_t); }
    size_t Alignment() const override { return 4; }

    using MetaDefinitionBase::Initialize;
    AAFRESULT Initialize(aafUID_constref id, IAAFClassDef* pObjType, aafCharacter_constptr pTypeName, aafUInt32 ids,
                         aafUID_constptr pTargetSet) override;
    AAFRESULT GetObjectType(IAAFClassDef** ppObjType) override;
    AAFRESULT CreateValue(IUnknown* pObj, IAAFPropertyValue** ppPropVal) override;
    AAFRESULT GetObject(IAAFPropertyValue* pPropVal, REFIID iid, IUnknown** ppObject) override;
    AAFRESULT SetObject(IAAFPropertyValue* pPropVal, IUnknown* pObject) override;

private:
    ClassDefinition* m_target;
};

}  // namespace aafmodel
