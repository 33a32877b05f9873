#include "MobView.h"

#include "../core/Enumerator.h"
#include "../core/Schema.h"
#include "../core/WideText.h"
#include "MobSlots.h"
#include "TaggedValueList.h"
#include "ViewSupport.h"
#include "aaf/IAAFEventMobSlot.h"
#include "aaf/IAAFMobSlot.h"
#include "aaf/IAAFTimelineMobSlot.h"
#include "aaf/IEnumAAFMobSlots.h"

namespace aafmodel {

AAFRESULT MobView::GetMobID(aafMobID_t* pMobID) {
    return Guarded([&] {
        Require(pMobID);
        *pMobID = m_object.GetRequired<aafMobID_t>(*Builtins(m_object).p.mobMobID);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobView::SetMobID(aafMobID_constref mobID) {
    return Guarded([&] {
        m_object.SetFixed(*Builtins(m_object).p.mobMobID, mobID);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobView::SetName(aafCharacter_constptr pName) {
    return Guarded([&] {
        m_object.SetString(*Builtins(m_object).p.mobName, WideArg(pName));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobView::GetName(aafCharacter* pName, aafUInt32 bufSize) {
    return Guarded([&] {
        CopyStringProperty(m_object, *Builtins(m_object).p.mobName, pName, bufSize);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobView::GetNameBufLen(aafUInt32* pBufSize) {
    return Guarded([&] {
        Require(pBufSize);
        *pBufSize = StringPropertyBufLen(m_object, *Builtins(m_object).p.mobName);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobView::CountSlots(aafNumSlots_t* pNumSlots) {
    if (!pNumSlots) return AAFRESULT_NULL_PARAM;
    const auto* slots = m_object.FindVector(*Builtins(m_object).p.mobSlots);
    *pNumSlots = slots ? static_cast<aafNumSlots_t>(slots->size()) : 0;
    return AAFRESULT_SUCCESS;
}

AAFRESULT MobView::AppendSlot(IAAFMobSlot* pSlot) {
    aafNumSlots_t count = 0;
    CountSlots(&count);
    return InsertSlotAt(count, pSlot);
}

AAFRESULT MobView::PrependSlot(IAAFMobSlot* pSlot) { return InsertSlotAt(0, pSlot); }

AAFRESULT MobView::InsertSlotAt(aafUInt32 index, IAAFMobSlot* pSlot) {
    return Guarded([&] {
        const BuiltinDefinitions& b = Builtins(m_object);
        m_object.InsertInto(*b.p.mobSlots, index, ObjectArg(pSlot, *b.c.mobSlot));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobView::RemoveSlotAt(aafUInt32 index) {
    return Guarded([&] {
        m_object.RemoveFrom(*Builtins(m_object).p.mobSlots, index);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobView::GetSlotAt(aafUInt32 index, IAAFMobSlot** ppSlot) {
    return Guarded([&] {
        const auto* slots = m_object.FindVector(*Builtins(m_object).p.mobSlots);
        if (!slots || index >= slots->size()) throw static_cast<int>(AAFRESULT_BADINDEX);
        return HandOut(*(*slots)[index], ppSlot);
    });
}

AAFRESULT MobView::GetSlots(IEnumAAFMobSlots** ppEnum) {
    return Guarded([&] {
        Require(ppEnum);
        std::vector<RefPtr<IAAFMobSlot>> items;
        if (const auto* slots = m_object.FindVector(*Builtins(m_object).p.mobSlots))
            for (const auto& slot : *slots) items.push_back(slot->Query<IAAFMobSlot>());
        *ppEnum = new Enumerator<IEnumAAFMobSlots, IAAFMobSlot>(std::move(items));
        (*ppEnum)->AddRef();
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobView::GetModTime(aafTimeStamp_t* pLastModified) {
    return Guarded([&] {
        Require(pLastModified);
        *pLastModified = m_object.GetRequired<aafTimeStamp_t>(*Builtins(m_object).p.mobLastModified);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobView::SetModTime(aafTimeStamp_constref modTime) {
    return Guarded([&] {
        m_object.SetFixed(*Builtins(m_object).p.mobLastModified, modTime);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobView::GetCreateTime(aafTimeStamp_t* pCreationTime) {
    return Guarded([&] {
        Require(pCreationTime);
        *pCreationTime = m_object.GetRequired<aafTimeStamp_t>(*Builtins(m_object).p.mobCreationTime);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobView::SetCreateTime(aafTimeStamp_constref createTime) {
    return Guarded([&] {
        m_object.SetFixed(*Builtins(m_object).p.mobCreationTime, createTime);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobView::AppendComment(aafCharacter_constptr pCategory, aafCharacter_constptr pComment) {
    return Guarded([&] {
        AppendTaggedString(m_object, *Builtins(m_object).p.mobUserComments, pCategory, pComment);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobView::CountComments(aafUInt32* pNumComments) {
    if (!pNumComments) return AAFRESULT_NULL_PARAM;
    *pNumComments = CountTagged(m_object, *Builtins(m_object).p.mobUserComments);
    return AAFRESULT_SUCCESS;
}

AAFRESULT MobView::GetComments(IEnumAAFTaggedValues** ppEnum) {
    return Guarded([&] {
        Require(ppEnum);
        *ppEnum = EnumerateTagged(m_object, *Builtins(m_object).p.mobUserComments);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobView::RemoveComment(IAAFTaggedValue* pComment) {
    return Guarded([&] {
        RemoveTagged(m_object, *Builtins(m_object).p.mobUserComments, pComment);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobView::AppendNewTimelineSlot(aafRational_t editRate, IAAFSegment* pSegment, aafSlotID_t slotID,
                                         aafCharacter_constptr pSlotName, aafPosition_t origin,
                                         IAAFTimelineMobSlot** ppNewSlot) {
    return Guarded([&] {
        ModelObject& segment = ObjectArg(pSegment, *Builtins(m_object).c.segment);
        ModelObject& slot = AppendTimelineSlot(m_object, editRate, segment, slotID, pSlotName, origin);
        return ppNewSlot ? HandOut(slot, ppNewSlot) : AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobView::GetMobInfo(aafTimeStamp_t* pLastModified, aafTimeStamp_t* pCreationTime, aafCharacter* pName,
                              aafInt32 bufSize) {
    return Guarded([&] {
        Check(GetModTime(pLastModified));
        Check(GetCreateTime(pCreationTime));
        if (bufSize < 0) throw static_cast<int>(AAFRESULT_SMALLBUF);
        return GetName(pName, static_cast<aafUInt32>(bufSize));
    });
}

AAFRESULT MobView::OffsetToMobTimecode(IAAFSegment*, aafPosition_t*, aafTimecode_t*) {
    return AAFRESULT_NOT_IMPLEMENTED;
}

AAFRESULT MobView::LookupSlot(aafSlotID_t slotId, IAAFMobSlot** ppDestSlot) {
    return Guarded([&] {
        Require(ppDestSlot);
        ModelObject* slot = FindSlot(m_object, slotId);
        Require(slot, AAFRESULT_SLOT_NOT_FOUND);
        return HandOut(*slot, ppDestSlot);
    });
}

AAFRESULT MobView::ChangeRef(aafMobID_constref, aafMobID_constref) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT MobView::CloneExternal(aafDepend_t, aafIncMedia_t, IAAFFile*, IAAFMob**) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT MobView::Copy(aafCharacter_constptr, IAAFMob**) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT MobView::AppendKLVData(IAAFKLVData*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT MobView::CountKLVData(aafUInt32* pNumData) {
    if (!pNumData) return AAFRESULT_NULL_PARAM;
    *pNumData = 0;
    return AAFRESULT_SUCCESS;
}
AAFRESULT MobView::GetKLVData(IEnumAAFKLVData**) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT MobView::RemoveKLVData(IAAFKLVData*) { return AAFRESULT_NOT_IMPLEMENTED; }

AAFRESULT MobView::AppendAttribute(aafCharacter_constptr pName, aafCharacter_constptr pValue) {
    return Guarded([&] {
        AppendTaggedString(m_object, *Builtins(m_object).p.mobAttributes, pName, pValue);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobView::CountAttributes(aafUInt32* pNumAttributes) {
    if (!pNumAttributes) return AAFRESULT_NULL_PARAM;
    *pNumAttributes = CountTagged(m_object, *Builtins(m_object).p.mobAttributes);
    return AAFRESULT_SUCCESS;
}

AAFRESULT MobView::GetAttributes(IEnumAAFTaggedValues** ppEnum) {
    return Guarded([&] {
        Require(ppEnum);
        *ppEnum = EnumerateTagged(m_object, *Builtins(m_object).p.mobAttributes);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobView::RemoveAttribute(IAAFTaggedValue* pAttribute) {
    return Guarded([&] {
        RemoveTagged(m_object, *Builtins(m_object).p.mobAttributes, pAttribute);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobView::SetUsageCode(aafUID_constref usageCode) {
    return Guarded([&] {
        m_object.SetFixed(*Builtins(m_object).p.mobUsageCode, usageCode);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobView::GetUsageCode(aafUID_t* pUsageCode) {
    return Guarded([&] {
        Require(pUsageCode);
        *pUsageCode = m_object.GetRequired<aafUID_t>(*Builtins(m_object).p.mobUsageCode);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobView::AppendNewStaticSlot(IAAFSegment*, aafSlotID_t, aafCharacter_constptr, IAAFStaticMobSlot**) {
    return AAFRESULT_NOT_IMPLEMENTED;
}

AAFRESULT MobView::AppendNewEventSlot(aafRational_t editRate, IAAFSegment* pSegment, aafSlotID_t slotID,
                                      aafCharacter_constptr pSlotName, aafPosition_t, IAAFEventMobSlot** ppNewSlot) {
    return Guarded([&] {
        const BuiltinDefinitions& b = Builtins(m_object);
        ModelObject& segment = ObjectArg(pSegment, *b.c.segment);
        RefPtr<ModelObject> slot = NewObject(*b.c.eventMobSlot);
        slot->SetFixed(*b.p.slotSlotID, slotID);
        if (pSlotName) slot->SetString(*b.p.slotSlotName, pSlotName);
        slot->SetRef(*b.p.slotSegment, segment);
        slot->SetFixed(*b.p.eventSlotEditRate, editRate);
        const auto* slots = m_object.FindVector(*b.p.mobSlots);
        m_object.InsertInto(*b.p.mobSlots, slots ? slots->size() : 0, *slot);
        return ppNewSlot ? HandOut(*slot, ppNewSlot) : AAFRESULT_SUCCESS;
    });
}

}  // namespace aafmodel
