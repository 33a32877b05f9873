#include "HeaderView.h"

#include "../core/LibraryVersion.h"
#include "../core/Schema.h"
#include "ContentStorageView.h"
#include "ViewSupport.h"

namespace aafmodel {

namespace {
IAAFContentStorage* Storage(ModelObject& header, RefPtr<IAAFContentStorage>& keep) {
    ModelObject* content = header.GetRef(*Builtins(header).p.headerContent);
    Require(content, AAFRESULT_INTERNAL_ERROR);
    keep = content->Query<IAAFContentStorage>();
    return keep.get();
}
}  // namespace

AAFRESULT HeaderView::LookupMob(aafMobID_constref mobID, IAAFMob** ppMob) {
    RefPtr<IAAFContentStorage> keep;
    return Guarded([&] { return Storage(m_object, keep)->LookupMob(mobID, ppMob); });
}

AAFRESULT HeaderView::CountMobs(aafMobKind_t mobKind, aafNumSlots_t* pResult) {
    RefPtr<IAAFContentStorage> keep;
    return Guarded([&] { return Storage(m_object, keep)->CountMobs(mobKind, pResult); });
}

AAFRESULT HeaderView::GetMobs(aafSearchCrit_t* pSearchCriteria, IEnumAAFMobs** ppMobsEnum) {
    RefPtr<IAAFContentStorage> keep;
    return Guarded([&] { return Storage(m_object, keep)->GetMobs(pSearchCriteria, ppMobsEnum); });
}

AAFRESULT HeaderView::AddMob(IAAFMob* pMob) {
    return Guarded([&] {
        const BuiltinDefinitions& b = Builtins(m_object);
        ModelObject& mob = ObjectArg(pMob, *b.c.mob);
        if (!mob.Initialized()) throw static_cast<int>(AAFRESULT_NOT_INITIALIZED);
        aafMobID_t id;
        if (!mob.GetFixed(*b.p.mobMobID, id)) throw static_cast<int>(AAFRESULT_INVALID_OBJ);
        ModelObject* content = m_object.GetRef(*b.p.headerContent);
        Require(content, AAFRESULT_INTERNAL_ERROR);
        if (const auto* mobs = content->FindVector(*b.p.contentMobs))
            for (const auto& other : *mobs) {
                aafMobID_t otherId;
                if (other->GetFixed(*b.p.mobMobID, otherId) && otherId == id)
                    throw static_cast<int>(AAFRESULT_DUPLICATE_MOBID);
            }
        const auto* mobs = content->FindVector(*b.p.contentMobs);
        content->InsertInto(*b.p.contentMobs, mobs ? mobs->size() : 0, mob);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT HeaderView::RemoveMob(IAAFMob* pMob) {
    return Guarded([&] {
        const BuiltinDefinitions& b = Builtins(m_object);
        ModelObject& mob = ObjectArg(pMob, *b.c.mob);
        ModelObject* content = m_object.GetRef(*b.p.headerContent);
        Require(content, AAFRESULT_INTERNAL_ERROR);
        if (const auto* mobs = content->FindVector(*b.p.contentMobs))
            for (size_t i = 0; i < mobs->size(); ++i)
                if ((*mobs)[i].get() == &mob) {
                    content->RemoveFrom(*b.p.contentMobs, i);
                    return AAFRESULT_SUCCESS;
                }
        throw static_cast<int>(AAFRESULT_MOB_NOT_FOUND);
    });
}

// No essence is ever held in a file of this library.
AAFRESULT HeaderView::CountEssenceData(aafUInt32* pResult) {
    if (!pResult) return AAFRESULT_NULL_PARAM;
    *pResult = 0;
    return AAFRESULT_SUCCESS;
}
AAFRESULT HeaderView::IsEssenceDataPresent(aafMobID_constref, aafFileFormat_t, aafBool* pResult) {
    if (!pResult) return AAFRESULT_NULL_PARAM;
    *pResult = kAAFFalse;
    return AAFRESULT_SUCCESS;
}
AAFRESULT HeaderView::EnumEssenceData(IEnumAAFEssenceData**) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT HeaderView::AddEssenceData(IAAFEssenceData*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT HeaderView::RemoveEssenceData(IAAFEssenceData*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT HeaderView::LookupEssenceData(aafMobID_constref, IAAFEssenceData**) { return AAFRESULT_NOT_IMPLEMENTED; }

AAFRESULT HeaderView::GetDictionary(IAAFDictionary** ppDictionary) {
    return Guarded([&] {
        ModelObject* dictionary = m_object.GetRef(*Builtins(m_object).p.headerDictionary);
        Require(dictionary, AAFRESULT_INTERNAL_ERROR);
        return HandOut(*dictionary, ppDictionary);
    });
}

AAFRESULT HeaderView::GetLastIdentification(IAAFIdentification** ppIdentification) {
    return Guarded([&] {
        const auto* list = m_object.FindVector(*Builtins(m_object).p.headerIdentificationList);
        if (!list || list->empty()) throw static_cast<int>(AAFRESULT_OBJECT_NOT_FOUND);
        return HandOut(*list->back(), ppIdentification);
    });
}

AAFRESULT HeaderView::LookupIdentification(aafUID_constref generation, IAAFIdentification** ppIdentification) {
    return Guarded([&] {
        const BuiltinDefinitions& b = Builtins(m_object);
        if (const auto* list = m_object.FindVector(*b.p.headerIdentificationList))
            for (const auto& ident : *list) {
                aafUID_t id;
                if (ident->GetFixed(*b.p.identGenerationAUID, id) && id == generation)
                    return HandOut(*ident, ppIdentification);
            }
        throw static_cast<int>(AAFRESULT_OBJECT_NOT_FOUND);
    });
}

AAFRESULT HeaderView::CountIdentifications(aafUInt32* pResult) {
    if (!pResult) return AAFRESULT_NULL_PARAM;
    const auto* list = m_object.FindVector(*Builtins(m_object).p.headerIdentificationList);
    *pResult = list ? static_cast<aafUInt32>(list->size()) : 0;
    return AAFRESULT_SUCCESS;
}

AAFRESULT HeaderView::GetIdentifications(IEnumAAFIdentifications**) { return AAFRESULT_NOT_IMPLEMENTED; }

AAFRESULT HeaderView::AppendIdentification(IAAFIdentification* pIdent) {
    return Guarded([&] {
        const BuiltinDefinitions& b = Builtins(m_object);
        ModelObject& ident = ObjectArg(pIdent, *b.c.identification);
        const auto* list = m_object.FindVector(*b.p.headerIdentificationList);
        m_object.InsertInto(*b.p.headerIdentificationList, list ? list->size() : 0, ident);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT HeaderView::GetIdentificationAt(aafUInt32 index, IAAFIdentification** ppIdentification) {
    return Guarded([&] {
        const auto* list = m_object.FindVector(*Builtins(m_object).p.headerIdentificationList);
        if (!list || index >= list->size()) throw static_cast<int>(AAFRESULT_BADINDEX);
        return HandOut(*(*list)[index], ppIdentification);
    });
}

AAFRESULT HeaderView::GetRefImplVersion(aafProductVersion_t* pVersion) {
    if (!pVersion) return AAFRESULT_NULL_PARAM;
    *pVersion = kLibraryVersion;
    return AAFRESULT_SUCCESS;
}

AAFRESULT HeaderView::GetFileRevision(aafVersionType_t* pRevision) {
    return Guarded([&] {
        Require(pRevision);
        *pRevision = m_object.GetRequired<aafVersionType_t>(*Builtins(m_object).p.headerVersion);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT HeaderView::GetLastModified(aafTimeStamp_t* pTimeStamp) {
    return Guarded([&] {
        Require(pTimeStamp);
        *pTimeStamp = m_object.GetRequired<aafTimeStamp_t>(*Builtins(m_object).p.headerLastModified);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT HeaderView::GetContentStorage(IAAFContentStorage** ppStorage) {
    return Guarded([&] {
        ModelObject* content = m_object.GetRef(*Builtins(m_object).p.headerContent);
        Require(content, AAFRESULT_INTERNAL_ERROR);
        return HandOut(*content, ppStorage);
    });
}

}  // namespace aafmodel
