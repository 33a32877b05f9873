#pragma once
/// The root object of a file: content, dictionary and identifications.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFHeader : public IUnknown {
public:
    virtual AAFRESULT LookupMob(aafMobID_constref mobID, IAAFMob** ppMob) = 0;
    virtual AAFRESULT CountMobs(aafMobKind_t mobKind, aafNumSlots_t* pResult) = 0;
    virtual AAFRESULT GetMobs(aafSearchCrit_t* pSearchCriteria, IEnumAAFMobs** ppMobsEnum) = 0;
    virtual AAFRESULT AddMob(IAAFMob* pMob) = 0;
    virtual AAFRESULT RemoveMob(IAAFMob* pMob) = 0;
    virtual AAFRESULT CountEssenceData(aafUInt32* pResult) = 0;
    virtual AAFRESULT IsEssenceDataPresent(aafMobID_constref fileMobID, aafFileFormat_t fmt, aafBool* pResult) = 0;
    virtual AAFRESULT EnumEssenceData(IEnumAAFEssenceData** ppEnum) = 0;
    virtual AAFRESULT AddEssenceData(IAAFEssenceData* pEssenceData) = 0;
    virtual AAFRESULT RemoveEssenceData(IAAFEssenceData* pEssenceData) = 0;
    virtual AAFRESULT LookupEssenceData(aafMobID_constref mobID, IAAFEssenceData** ppEssenceData) = 0;
    virtual AAFRESULT GetDictionary(IAAFDictionary** ppDictionary) = 0;
    virtual AAFRESULT GetLastIdentification(IAAFIdentification** ppIdentification) = 0;
    virtual AAFRESULT LookupIdentification(aafUID_constref generation, IAAFIdentification** ppIdentification) = 0;
    virtual AAFRESULT CountIdentifications(aafUInt32* pResult) = 0;
    virtual AAFRESULT GetIdentifications(IEnumAAFIdentifications** ppEnum) = 0;
    virtual AAFRESULT AppendIdentification(IAAFIdentification* pIdent) = 0;
    virtual AAFRESULT GetIdentificationAt(aafUInt32 index, IAAFIdentification** ppIdentification) = 0;
    virtual AAFRESULT GetRefImplVersion(aafProductVersion_t* pVersion) = 0;
    virtual AAFRESULT GetFileRevision(aafVersionType_t* pRevision) = 0;
    virtual AAFRESULT GetLastModified(aafTimeStamp_t* pTimeStamp) = 0;
    virtual AAFRESULT GetContentStorage(IAAFContentStorage** ppStorage) = 0;

protected:
    ~IAAFHeader() = default;
};
AAF_INTERFACE_ID(IAAFHeader);
