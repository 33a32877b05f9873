#include "ContentStorageView.h"

#include <cwchar>

#include "../core/ClassDefinition.h"
#include "../core/Enumerator.h"
#include "../core/Schema.h"
#include "ViewSupport.h"
#include "aaf/IAAFMob.h"
#include "aaf/IEnumAAFMobs.h"

namespace aafmodel {

namespace {
// The search criteria this library answers: none, by Mob ID, by name, by
// kind (master, file and tape alike count as source Mobs here) and by class.
bool Matches(const ModelObject& mob, const aafSearchCrit_t* crit) {
    const BuiltinDefinitions& b = Builtins(mob);
    if (!crit) return true;
    switch (crit->searchTag) {
        case kAAFNoSearch:
            return true;
        case kAAFByMobID: {
            aafMobID_t id;
            return mob.GetFixed(*b.p.mobMobID, id) && id == crit->tags.mobID;
        }
        case kAAFByName: {
            std::wstring name;
            return crit->tags.name && mob.GetString(*b.p.mobName, name) && name == crit->tags.name;
        }
        case kAAFByClass:
            return mob.IsA(crit->tags.objClass);
        case kAAFByMobKind:
            switch (crit->tags.mobKind) {
                case kAAFAllMob:
                    return true;
                case kAAFMasterMob:
                    return mob.Class().IsA(*b.c.masterMob);
                case kAAFFileMob:
                case kAAFTapeMob:
                case kAAFPhysicalMob:
                    return mob.Class().IsA(*b.c.sourceMob);
                default:
                    return false;
            }
        default:
            throw static_cast<int>(AAFRESULT_NOT_IMPLEMENTED);
    }
}
}  // namespace

AAFRESULT ContentStorageView::LookupMob(aafMobID_constref mobID, IAAFMob** ppMob) {
    return Guarded([&] {
        Require(ppMob);
        const BuiltinDefinitions& b = Builtins(m_object);
        if (const auto* mobs = m_object.FindVector(*b.p.contentMobs))
            for (const auto& mob : *mobs) {
                aafMobID_t id;
                if (mob->GetFixed(*b.p.mobMobID, id) && id == mobID) return HandOut(*mob, ppMob);
            }
        throw static_cast<int>(AAFRESULT_MOB_NOT_FOUND);
    });
}

AAFRESULT ContentStorageView::CountMobs(aafMobKind_t mobKind, aafNumSlots_t* pResult) {
    return Guarded([&] {
        Require(pResult);
        aafSearchCrit_t crit{};
        crit.searchTag = kAAFByMobKind;
        crit.tags.mobKind = mobKind;
        aafNumSlots_t count = 0;
        if (const auto* mobs = m_object.FindVector(*Builtins(m_object).p.contentMobs))
            for (const auto& mob : *mobs) count += Matches(*mob, &crit) ? 1 : 0;
        *pResult = count;
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT ContentStorageView::GetMobs(aafSearchCrit_t* pSearchCriteria, IEnumAAFMobs** ppEnum) {
    return Guarded([&] {
        Require(ppEnum);
        std::vector<RefPtr<IAAFMob>> items;
        if (const auto* mobs = m_object.FindVector(*Builtins(m_object).p.contentMobs))
            for (const auto& mob : *mobs)
                if (Matches(*mob, pSearchCriteria)) items.push_back(mob->Query<IAAFMob>());
        *ppEnum = new Enumerator<IEnumAAFMobs, IAAFMob>(std::move(items));
        (*ppEnum)->AddRef();
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT ContentStorageView::CountEssenceData(aafUInt32* pResult) {
    if (!pResult) return AAFRESULT_NULL_PARAM;
    *pResult = 0;
    return AAFRESULT_SUCCESS;
}
AAFRESULT ContentStorageView::IsEssenceDataPresent(aafMobID_constref, aafFileFormat_t, aafBool* pResult) {
    if (!pResult) return AAFRESULT_NULL_PARAM;
    *pResult = kAAFFalse;
    return AAFRESULT_SUCCESS;
}
AAFRESULT ContentStorageView::EnumEssenceData(IEnumAAFEssenceData**) { return AAFRESULT_NOT_IMPLEMENTED; }

}  // namespace aafmodel
