#include "MasterMobView.h"

#include "../core/DataDefinition.h"
#include "../core/Schema.h"
#include "MobSlots.h"
#include "ViewSupport.h"

namespace aafmodel {

AAFRESULT MasterMobView::Initialize() {
    return Guarded([&] {
        InitializeMob(m_object);
        return AAFRESULT_SUCCESS;
    });
}

// A slot that refers to the whole of a slot of a Source Mob, at that slot's
// edit rate and length.
AAFRESULT MasterMobView::AddMasterSlot(IAAFDataDef* pDataDef, aafSlotID_t sourceSlotID, IAAFSourceMob* pSourceMob,
                                       aafSlotID_t masterSlotID, aafCharacter_constptr pSlotName) {
    return Guarded([&] {
        Require(pSlotName);
        const BuiltinDefinitions& b = Builtins(m_object);
        DataDefinition& def = DataDefArg(pDataDef);
        ModelObject& source = ObjectArg(pSourceMob, *b.c.sourceMob);
        ModelObject* sourceSlot = FindSlot(source, sourceSlotID);
        Require(sourceSlot, AAFRESULT_SLOT_NOT_FOUND);
        ModelObject* segment = sourceSlot->GetRef(*b.p.slotSegment);
        Require(segment, AAFRESULT_SLOT_NOT_FOUND);
        if (&GetDataDefinition(*segment) != &def) throw static_cast<int>(AAFRESULT_INVALID_DATADEF);
        aafSourceRef_t ref{};
        ref.sourceID = source.GetRequired<aafMobID_t>(*b.p.mobMobID);
        ref.sourceSlotID = sourceSlotID;
        aafLength_t length = 0;
        segment->GetFixed(*b.p.componentLength, length);
        aafRational_t rate{0, 1};
        sourceSlot->GetFixed(*b.p.timelineEditRate, rate);
        RefPtr<ModelObject> clip = NewSourceClip(m_object, def, length, ref);
        AppendTimelineSlot(m_object, rate, *clip, masterSlotID, pSlotName, 0);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MasterMobView::GetTapeName(aafUInt32, aafCharacter*, aafUInt32) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT MasterMobView::GetTapeNameBufLen(aafUInt32, aafUInt32*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT MasterMobView::GetNumRepresentations(aafSlotID_t, aafNumSlots_t*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT MasterMobView::GetRepresentation(aafSlotID_t, aafUInt32, IAAFSegment**) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT MasterMobView::GetCriteriaSegment(aafSlotID_t, aafMediaCriteria_t*, IAAFSegment**) {
    return AAFRESULT_NOT_IMPLEMENTED;
}

AAFRESULT MasterMobView::AppendPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot, IAAFDataDef* pEssenceKind,
                                             aafSourceRef_t ref, aafLength_t srcRefLength) {
    return Guarded([&] {
        aafmodel::AppendPhysSourceRef(m_object, editrate, aMobSlot, pEssenceKind, ref, srcRefLength);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MasterMobView::NewPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot, IAAFDataDef* pEssenceKind,
                                          aafSourceRef_t ref, aafLength_t srcRefLength) {
    return Guarded([&] {
        aafmodel::NewPhysSourceRef(m_object, editrate, aMobSlot, pEssenceKind, ref, srcRefLength);
        return AAFRESULT_SUCCESS;
    });
}

// No essence is written or read through this library.
AAFRESULT MasterMobView::CreateEssence(aafSlotID_t, IAAFDataDef*, aafUID_constref, aafRational_t, aafRational_t,
                                       aafCompressEnable_t, IAAFLocator*, aafUID_constref, IAAFEssenceAccess**) {
    return AAFRESULT_NOT_IMPLEMENTED;
}
AAFRESULT MasterMobView::CreateMultiEssence(aafUID_constref, aafUInt16, aafmMultiCreate_t*, aafCompressEnable_t,
                                            IAAFLocator*, aafUID_constref, IAAFEssenceMultiAccess**) {
    return AAFRESULT_NOT_IMPLEMENTED;
}
AAFRESULT MasterMobView::OpenEssence(aafSlotID_t, aafMediaCriteria_t*, aafMediaOpenMode_t, aafCompressEnable_t,
                                     IAAFEssenceAccess**) {
    return AAFRESULT_NOT_IMPLEMENTED;
}
AAFRESULT MasterMobView::OpenMultiEssence(aafSlotID_t, aafMediaCriteria_t*, aafMediaOpenMode_t, aafCompressEnable_t,
                                          IAAFEssenceMultiAccess**) {
    return AAFRESULT_NOT_IMPLEMENTED;
}
AAFRESULT MasterMobView::CountChannels(aafSlotID_t, aafMediaCriteria_t*, IAAFDataDef*, aafUInt16*) {
    return AAFRESULT_NOT_IMPLEMENTED;
}

}  // namespace aafmodel
