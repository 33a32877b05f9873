#pragma once
/// The Mobs of a file.
#include "../core/ViewBase.h"
#include "aaf/IAAFContentStorage.h"

namespace aafmodel {

class ContentStorageView final : public View<IAAFContentStorage> {
public:
    using View::View;

    AAFRESULT LookupMob(aafMobID_constref mobID, IAAFMob** ppMob) override;
    AAFRESULT CountMobs(aafMobKind_t mobKind, aafNumSlots_t* pResult) override;
    AAFRESULT GetMobs(aafSearchCrit_t* pSearchCriteria, IEnumAAFMobs** ppEnum) override;
    AAFRESULT CountEssenceData(aafUInt32* pResult) override;
    AAFRESULT IsEssenceDataPresent(aafMobID_constref fileMobID, aafFileFormat_t fmt, aafBool* pResult) override;
    AAFRESULT EnumEssenceData(IEnumAAFEssenceData** ppEnum) override;
};

}  // namespace aafmodel
