#include "MetaDefinitionBase.h"

#include "Guard.h"
#include "Schema.h"
#include "WideText.h"

namespace aafmodel {

MetaDefinitionBase::MetaDefinitionBase(Schema& schema, const aafUID_t& id, std::wstring name)
    : m_schema(schema), m_id(id), m_name(std::move(name)), m_defined(!m_name.empty()) {}

aafUInt32 MetaDefinitionBase::AddRef() { return m_schema.AddRef(); }
aafUInt32 MetaDefinitionBase::Release() { return m_schema.Release(); }

void MetaDefinitionBase::Define(const aafUID_t& id, aafCharacter_constptr name) {
    Require(name);
    if (m_defined) throw static_cast<int>(AAFRESULT_ALREADY_INITIALIZED);
    m_id = id;
    m_name = name;
    m_defined = true;
}

AAFRESULT MetaDefinitionBase::Initialize(aafUID_constref id, aafCharacter_constptr pName,
                                         aafCharacter_constptr pDescription) {
    return Guarded([&] {
        Define(id, pName);
        if (pDescription) m_description = pDescription;
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MetaDefinitionBase::GetAUID(aafUID_t* pAuid) {
    if (!pAuid) return AAFRESULT_NULL_PARAM;
    *pAuid = m_id;
    return AAFRESULT_SUCCESS;
}

AAFRESULT MetaDefinitionBase::SetName(aafCharacter_constptr pName) {
    return Guarded([&] {
        m_name = WideArg(pName);
        m_schema.NoteChangedInPlace();
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MetaDefinitionBase::GetName(aafCharacter* pName, aafUInt32 bufSize) {
    return Guarded([&] {
        CopyWide(m_name, pName, bufSize);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MetaDefinitionBase::GetNameBufLen(aafUInt32* pBufSize) {
    if (!pBufSize) return AAFRESULT_NULL_PARAM;
    *pBufSize = WideBufLen(m_name);
    return AAFRESULT_SUCCESS;
}

AAFRESULT MetaDefinitionBase::SetDescription(aafCharacter_constptr pDescription) {
    return Guarded([&] {
        m_description = WideArg(pDescription);
        m_schema.NoteChangedInPlace();
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MetaDefinitionBase::GetDescription(aafCharacter* pDescription, aafUInt32 bufSize) {
    return Guarded([&] {
        CopyWide(m_description, pDescription, bufSize);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MetaDefinitionBase::GetDescriptionBufLen(aafUInt32* pBufSize) {
    if (!pBufSize) return AAFRESULT_NULL_PARAM;
    *pBufSize = WideBufLen(m_description);
    return AAFRESULT_SUCCESS;
}

}  // namespace aafmodel
