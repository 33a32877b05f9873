#include "DataDefinition.h"

#include "Guard.h"
#include "InternalIDs.h"
#include "Schema.h"
#include "WideText.h"
#include "aaf/AAFDataDefs.h"

namespace aafmodel {

DataDefinition::DataDefinition(Schema& schema, const aafUID_t& id, std::wstring name)
    : m_schema(schema), m_id(id), m_name(std::move(name)) {}

AAFRESULT DataDefinition::QueryInterface(REFIID riid, void** ppvObj) {
    if (!ppvObj) return AAFRESULT_NULL_PARAM;
    if (riid == IID_IUnknown || riid == IID_IAAFDataDef)
        *ppvObj = static_cast<IAAFDataDef*>(this);
    else if (riid == IID_IAAFDefObject)
        *ppvObj = static_cast<IAAFDefObject*>(this);
    else if (riid == kInternal_DataDefinition)
        *ppvObj = this;
    else {
        *ppvObj = nullptr;
        return AAF_E_NOINTERFACE;
    }
    AddRef();
    return AAFRESULT_SUCCESS;
}

aafUInt32 DataDefinition::AddRef() { return m_schema.AddRef(); }
aafUInt32 DataDefinition::Release() { return m_schema.Release(); }

AAFRESULT DataDefinition::Initialize(aafUID_constref id, aafCharacter_constptr pName,
                                     aafCharacter_constptr pDescription) {
    return Guarded([&] {
        if (Defined()) throw static_cast<int>(AAFRESULT_ALREADY_INITIALIZED);
        m_name = WideArg(pName);
        m_id = id;
        if (pDescription) m_description = pDescription;
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT DataDefinition::Initialize(aafUID_constref id, aafCharacter_constptr pName) {
    return Initialize(id, pName, nullptr);
}

AAFRESULT DataDefinition::IsKind(const aafUID_t& modern, const aafUID_t& legacy, aafBool* result) const {
    if (!result) return AAFRESULT_NULL_PARAM;
    *result = (m_id == modern || m_id == legacy) ? kAAFTrue : kAAFFalse;
    return AAFRESULT_SUCCESS;
}

AAFRESULT DataDefinition::IsPictureKind(aafBool* b) {
    return IsKind(kAAFDataDef_Picture, kAAFDataDef_LegacyPicture, b);
}
AAFRESULT DataDefinition::IsMatteKind(aafBool*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DataDefinition::IsPictureWithMatteKind(aafBool*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DataDefinition::IsSoundKind(aafBool* b) { return IsKind(kAAFDataDef_Sound, kAAFDataDef_LegacySound, b); }
AAFRESULT DataDefinition::IsTimecodeKind(aafBool* b) {
    return IsKind(kAAFDataDef_Timecode, kAAFDataDef_LegacyTimecode, b);
}
AAFRESULT DataDefinition::IsEdgecodeKind(aafBool*) { return AAFRESULT_NOT_IMPLEMENTED; }

AAFRESULT DataDefinition::IsDataDefOf(IAAFDataDef* pDataDef, aafBool* bIsDataDefOf) {
    if (!bIsDataDefOf) return AAFRESULT_NULL_PARAM;
    DataDefinition* other = Borrow<DataDefinition>(pDataDef, kInternal_DataDefinition);
    if (!other) return AAFRESULT_NULL_PARAM;
    *bIsDataDefOf = other == this ? kAAFTrue : kAAFFalse;
    return AAFRESULT_SUCCESS;
}
AAFRESULT DataDefinition::DoesDataDefConvertTo(IAAFDataDef*, aafBool*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DataDefinition::DoesDataDefConvertFrom(IAAFDataDef*, aafBool*) { return AAFRESULT_NOT_IMPLEMENTED; }

AAFRESULT DataDefinition::GetAUID(aafUID_t* pAuid) {
    if (!pAuid) return AAFRESULT_NULL_PARAM;
    *pAuid = m_id;
    return AAFRESULT_SUCCESS;
}
AAFRESULT DataDefinition::SetName(aafCharacter_constptr pName) {
    return Guarded([&] {
        m_name = WideArg(pName);
        m_schema.NoteChangedInPlace();
        return AAFRESULT_SUCCESS;
    });
}
AAFRESULT DataDefinition::GetName(aafCharacter* pName, aafUInt32 bufSize) {
    return Guarded([&] {
        CopyWide(m_name, pName, bufSize);
        return AAFRESULT_SUCCESS;
    });
}
AAFRESULT DataDefinition::GetNameBufLen(aafUInt32* pBufSize) {
    if (!pBufSize) return AAFRESULT_NULL_PARAM;
    *pBufSize = WideBufLen(m_name);
    return AAFRESULT_SUCCESS;
}
AAFRESULT DataDefinition::SetDescription(aafCharacter_constptr pDescription) {
    return Guarded([&] {
        m_description = WideArg(pDescription);
        m_schema.NoteChangedInPlace();
        return AAFRESULT_SUCCESS;
    });
}
AAFRESULT DataDefinition::GetDescription(aafCharacter* pDescription, aafUInt32 bufSize) {
    return Guarded([&] {
        CopyWide(m_description, pDescription, bufSize);
        return AAFRESULT_SUCCESS;
    });
}
AAFRESULT DataDefinition::GetDescriptionBufLen(aafUInt32* pBufSize) {
    if (!pBufSize) return AAFRESULT_NULL_PARAM;
    *pBufSize = WideBufLen(m_description);
    return AAFRESULT_SUCCESS;
}

}  // namespace aafmodel
