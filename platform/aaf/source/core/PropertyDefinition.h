#pragma once
/// A property of a class: id, name, type, and whether it may be absent.
#include "MetaDefinitionBase.h"
#include "aaf/IAAFPropertyDef.h"

namespace aafmodel {

class ClassDefinition;
class TypeDefinition;

class PropertyDefinition final : public IAAFPropertyDef, public MetaDefinitionBase {
public:
    PropertyDefinition(Schema& schema, const aafUID_t& id, std::wstring name, TypeDefinition& type, bool optional,
                       ClassDefinition& owner);

    TypeDefinition& Type() const { return m_type; }
    bool Optional() const { return m_optional; }
    ClassDefinition& Owner() const { return m_owner; }
    /// Place in the order of all property definitions of the schema.
    aafUInt32 Serial() const { return m_serial; }

    AAFRESULT QueryInterface(REFIID riid, void** ppvObj) override;
    aafUInt32 AddRef() override { return MetaDefinitionBase::AddRef(); }
    aafUInt32 Release() override { return MetaDefinitionBase::Release(); }

    AAFRESULT GetTypeDef(IAAFTypeDef** ppTypeDef) override;
    AAFRESULT GetName(aafCharacter* pName, aafUInt32 bufSize) override {
        return MetaDefinitionBase::GetName(pName, bufSize);
    }
    AAFRESULT GetNameBufLen(aafUInt32* pBufSize) override { return MetaDefinitionBase::GetNameBufLen(pBufSize); }
    AAFRESULT GetIsOptional(aafBool* pIsOptional) override;
    AAFRESULT GetIsUniqueIdentifier(aafBool* pIsUniqueIdentifier) override;

private:
    TypeDefinition& m_type;
    bool m_optional;
    ClassDefinition& m_owner;
    aafUInt32 m_serial;
};

}  // namespace aafmodel
