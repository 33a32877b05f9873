#pragma once
/// A data definition (sound, timecode, picture ...), kept by the dictionary
/// and named by components through a weak reference.
#include <string>

#include "aaf/IAAFDataDef.h"
#include "aaf/IAAFDefObject.h"

namespace aafmodel {

class Schema;

class DataDefinition final : public IAAFDataDef, public IAAFDefObject {
public:
    /// An undefined one, for CreateInstance of the DataDefinition class, has an empty name.
    DataDefinition(Schema& schema, const aafUID_t& id, std::wstring name);

    const aafUID_t& Id() const { return m_id; }
    const std::wstring& Name() const { return m_name; }
    bool Defined() const { return !m_name.empty(); }

    AAFRESULT QueryInterface(REFIID riid, void** ppvObj) override;
    aafUInt32 AddRef() override;
    aafUInt32 Release() override;

    AAFRESULT Initialize(aafUID_constref id, aafCharacter_constptr pName, aafCharacter_constptr pDescription) override;
    AAFRESULT IsPictureKind(aafBool* bIsPictureKind) override;
    AAFRESULT IsMatteKind(aafBool* bIsMatteKind) override;
    AAFRESULT IsPictureWithMatteKind(aafBool* bIsPictureWithMatteKind) override;
    AAFRESULT IsSoundKind(aafBool* bIsSoundKind) override;
    AAFRESULT DoesDataDefConvertTo(IAAFDataDef* id, aafBool* bDoesConvertTo) override;
    AAFRESULT IsDataDefOf(IAAFDataDef* pDataDef, aafBool* bIsDataDefOf) override;
    AAFRESULT DoesDataDefConvertFrom(IAAFDataDef* pDataDef, aafBool* bDoesConvertFrom) override;
    AAFRESULT IsEdgecodeKind(aafBool* bIsEdgecodeKind) override;
    AAFRESULT IsTimecodeKind(aafBool* bIsTimecodeKind) override;

    AAFRESULT Initialize(aafUID_constref id, aafCharacter_constptr pName) override;
    AAFRESULT GetAUID(aafUID_t* pAuid) override;
    AAFRESULT SetName(aafCharacter_constptr pName) override;
    AAFRESULT GetName(aafCharacter* pName, aafUInt32 bufSize) override;
    AAFRESULT GetNameBufLen(aafUInt32* pBufSize) override;
    AAFRESULT SetDescription(aafCharacter_constptr pDescription) override;
    AAFRESULT GetDescription(aafCharacter* pDescription, aafUInt32 bufSize) override;
    AAFRESULT GetDescriptionBufLen(aafUInt32* pBufSize) override;

private:
    /// Whether this definition is one of the two given kinds (modern and legacy ids).
    AAFRESULT IsKind(const aafUID_t& modern, const aafUID_t& legacy, aafBool* result) const;

    Schema& m_schema;
    aafUID_t m_id;
    std::wstring m_name;
    std::wstring m_description;
};

}  // namespace aafmodel
