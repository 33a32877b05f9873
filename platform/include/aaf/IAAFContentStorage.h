#pragma once
/// The Mobs (and essence data) of a file.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFContentStorage : public IUnknown {
public:
    virtual AAFRESULT LookupMob(aafMobID_constref mobID, IAAFMob** ppMob) = 0;
    virtual AAFRESULT CountMobs(aafMobKind_t mobKind, aafNumSlots_t* pResult) = 0;
    virtual AAFRESULT GetMobs(aafSearchCrit_t* pSearchCriteria, IEnumAAFMobs** ppEnum) = 0;
    virtual AAFRESULT CountEssenceData(aafUInt32* pResult) = 0;
    virtual AAFRESULT IsEssenceDataPresent(aafMobID_constref fileMobID, aafFileFormat_t fmt, aafBool* pResult) = 0;
    virtual AAFRESULT EnumEssenceData(IEnumAAFEssenceData** ppEnum) = 0;

protected:
    ~IAAFContentStorage() = default;
};
AAF_INTERFACE_ID(IAAFContentStorage);
