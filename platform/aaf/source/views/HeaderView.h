#pragma once
/// The header of a file: its Mobs, dictionary and identifications.
#include "../core/ViewBase.h"
#include "aaf/IAAFHeader.h"

namespace aafmodel {

class HeaderView final : public View<IAAFHeader> {
public:
    using View::View;

    AAFRESULT LookupMob(aafMobID_constref mobID, IAAFMob** ppMob) override;
    AAFRESULT CountMobs(aafMobKind_t mobKind, aafNumSlots_t* pResult) override;
    AAFRESULT GetMobs(aafSearchCrit_t* pSearchCriteria, IEnumAAFMobs** ppMobsEnum) override;
    AAFRESULT AddMob(IAAFMob* pMob) override;
    AAFRESULT RemoveMob(IAAFMob* pMob) override;
    AAFRESULT CountEssenceData(aafUInt32* pResult) override;
    AAFRESULT IsEssenceDataPresent(aafMobID_constref fileMobID, aafFileFormat_t fmt, aafBool* pResult) override;
    AAFRESULT EnumEssenceData(IEnumAAFEssenceData** ppEnum) override;
    AAFRESULT AddEssenceData(IAAFEssenceData* pEssenceData) override;
    AAFRESULT RemoveEssenceData(IAAFEssenceData* pEssenceData) override;
    AAFRESULT LookupEssenceData(aafMobID_constref mobID, IAAFEssenceData** ppEssenceData) override;
    AAFRESULT GetDictionary(IAAFDictionary** ppDictionary) override;
    AAFRESULT GetLastIdentification(IAAFIdentification** ppIdentification) override;
    AAFRESULT LookupIdentification(aafUID_constref generation, IAAFIdentification** ppIdentification) override;
    AAFRESULT CountIdentifications(aafUInt32* pResult) override;
    AAFRESULT GetIdentifications(IEnumAAFIdentifications** ppEnum) override;
    AAFRESULT AppendIdentification(IAAFIdentification* pIdent) override;
    AAFRESULT GetIdentificationAt(aafUInt32 index, IAAFIdentification** ppIdentification) override;
    AAFRESULT GetRefImplVersion(aafProductVersion_t* pVersion) override;
    AAFRESULT GetFileRevision(aafVersionType_t* pRevision) override;
    AAFRESULT GetLastModified(aafTimeStamp_t* pTimeStamp) override;
    AAFRESULT GetContentStorage(IAAFContentStorage** ppStorage) override;
};

}  // namespace aafmodel
