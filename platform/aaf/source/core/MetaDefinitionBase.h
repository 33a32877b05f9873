#pragma once
/// Identity, name and description shared by class, property and type
/// definitions. Every definition belongs to one schema and lives as long as
/// it: its reference count is the schema's.
#include <string>

#include "aaf/IAAFMetaDefinition.h"

namespace aafmodel {

class Schema;

class MetaDefinitionBase : public IAAFMetaDefinition {
public:
    MetaDefinitionBase(Schema& schema, const aafUID_t& id, std::wstring name);
    virtual ~MetaDefinitionBase() = default;

    const aafUID_t& Id() const { return m_id; }
    const std::wstring& Name() const { return m_name; }
    Schema& GetSchema() const { return m_schema; }
    /// False for a definition made by CreateMetaInstance and not yet initialised.
    bool Defined() const { return m_defined; }

    aafUInt32 AddRef() override;
    aafUInt32 Release() override;

    AAFRESULT Initialize(aafUID_constref id, aafCharacter_constptr pName, aafCharacter_constptr pDescription) override;
    AAFRESULT GetAUID(aafUID_t* pAuid) override;
    AAFRESULT SetName(aafCharacter_constptr pName) override;
    AAFRESULT GetName(aafCharacter* pName, aafUInt32 bufSize) override;
    AAFRESULT GetNameBufLen(aafUInt32* pBufSize) override;
    AAFRESULT SetDescription(aafCharacter_constptr pDescription) override;
    AAFRESULT GetDescription(aafCharacter* pDescription, aafUInt32 bufSize) override;
    AAFRESULT GetDescriptionBufLen(aafUInt32* pBufSize) override;

protected:
    /// Sets identity and name once; a second time throws AAFRESULT_ALREADY_INITIALIZED.
    void Define(const aafUID_t& id, aafCharacter_constptr name);

    Schema& m_schema;
    aafUID_t m_id;
    std::wstring m_name;
    std::wstring m_description;
    bool m_defined;
};

}  // namespace aafmodel
