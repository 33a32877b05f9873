#include "MobSlots.h"

#include <memory>
#include <unordered_map>

#include "../core/DataDefinition.h"
#include "../core/PropertyDefinition.h"
#include "../core/Schema.h"
#include "ViewSupport.h"

namespace aafmodel {

namespace {

// Up to this many slots a scan is quicker than keeping a table.
constexpr size_t kSlotsScanned = 16;

// A Mob's slots by id, so that a Mob of many slots is built in linear time.
// The first of equal ids wins, as in a scan. Slots appended since the last
// lookup are taken in then; any other change that the schema counts makes
// the table start again.
struct SlotIndex final : ModelObject::Annex {
    aafUInt64 changes = 0;
    const std::vector<RefPtr<ModelObject>>* slots = nullptr;
    size_t indexed = 0;
    std::unordered_map<aafSlotID_t, ModelObject*> byId;
};

bool SlotHasID(const ModelObject& slot, const PropertyDefinition& slotID, aafSlotID_t id) {
    aafSlotID_t value = 0;
    return slot.GetFixed(slotID, value) && value == id;
}

SlotIndex& CurrentIndex(const ModelObject& mob, const std::vector<RefPtr<ModelObject>>& slots) {
    auto* index = dynamic_cast<SlotIndex*>(mob.GetAnnex());
    const aafUInt64 changes = mob.GetSchema().ChangeCount();
    if (!index || index->changes != changes || index->slots != &slots || index->indexed > slots.size()) {
        auto fresh = std::make_unique<SlotIndex>();
        fresh->changes = changes;
        fresh->slots = &slots;
        index = fresh.get();
        mob.SetAnnex(std::move(fresh));
    }
    return *index;
}

}  // namespace

ModelObject* FindSlot(const ModelObject& mob, aafSlotID_t slotID) {
    const BuiltinDefinitions& b = Builtins(mob);
    const auto* slots = mob.FindVector(*b.p.mobSlots);
    if (!slots) return nullptr;
    if (slots->size() <= kSlotsScanned) {
        for (const auto& slot : *slots)
            if (SlotHasID(*slot, *b.p.slotSlotID, slotID)) return slot.get();
        return nullptr;
    }
    SlotIndex& index = CurrentIndex(mob, *slots);
    for (; index.indexed < slots->size(); ++index.indexed) {
        ModelObject& slot = *(*slots)[index.indexed];
        aafSlotID_t id = 0;
        if (slot.GetFixed(*b.p.slotSlotID, id)) index.byId.emplace(id, &slot);
    }
    const auto found = index.byId.find(slotID);
    return found == index.byId.end() ? nullptr : found->second;
}

ModelObject& AppendTimelineSlot(ModelObject& mob, const aafRational_t& editRate, ModelObject& segment,
                                aafSlotID_t slotID, aafCharacter_constptr name, aafPosition_t origin) {
    const BuiltinDefinitions& b = Builtins(mob);
    if (!segment.Class().IsA(*b.c.segment)) throw static_cast<int>(AAFRESULT_INVALID_OBJ);
    RefPtr<ModelObject> slot = NewObject(*b.c.timelineMobSlot);
    slot->SetFixed(*b.p.slotSlotID, slotID);
    if (name) slot->SetString(*b.p.slotSlotName, name);
    slot->SetRef(*b.p.slotSegment, segment);
    slot->SetFixed(*b.p.timelineEditRate, editRate);
    slot->SetFixed(*b.p.timelineOrigin, origin);
    const auto* slots = mob.FindVector(*b.p.mobSlots);
    mob.InsertInto(*b.p.mobSlots, slots ? slots->size() : 0, *slot);
    return *slot;
}

RefPtr<ModelObject> NewSourceClip(const ModelObject& anyOfFile, const DataDefinition& def, aafLength_t length,
                                  const aafSourceRef_t& ref) {
    const BuiltinDefinitions& b = Builtins(anyOfFile);
    RefPtr<ModelObject> clip = NewObject(*b.c.sourceClip);
    SetDataDefinition(*clip, def);
    clip->SetFixed(*b.p.componentLength, length);
    clip->SetFixed(*b.p.sourceRefSourceID, ref.sourceID);
    clip->SetFixed(*b.p.sourceRefSourceMobSlotID, ref.sourceSlotID);
    clip->SetFixed(*b.p.sourceClipStartTime, ref.startTime);
    return clip;
}

void NewPhysSourceRef(ModelObject& mob, const aafRational_t& editRate, aafSlotID_t slotID, IAAFDataDef* pDataDef,
                      const aafSourceRef_t& ref, aafLength_t length) {
    RefPtr<ModelObject> clip = NewSourceClip(mob, DataDefArg(pDataDef), length, ref);
    if (ModelObject* slot = FindSlot(mob, slotID))
        slot->SetRef(*Builtins(mob).p.slotSegment, *clip);
    else
        AppendTimelineSlot(mob, editRate, *clip, slotID, nullptr, 0);
}

void AppendPhysSourceRef(ModelObject& mob, const aafRational_t& editRate, aafSlotID_t slotID, IAAFDataDef* pDataDef,
                         const aafSourceRef_t& ref, aafLength_t length) {
    const BuiltinDefinitions& b = Builtins(mob);
    DataDefinition& def = DataDefArg(pDataDef);
    RefPtr<ModelObject> clip = NewSourceClip(mob, def, length, ref);
    ModelObject* slot = FindSlot(mob, slotID);
    if (!slot) {
        AppendTimelineSlot(mob, editRate, *clip, slotID, nullptr, 0);
        return;
    }
    RefPtr<ModelObject> segment = slot->GetRef(*b.p.slotSegment);
    if (!segment || !segment->Class().IsA(*b.c.sequence)) {
        RefPtr<ModelObject> sequence = NewObject(*b.c.sequence);
        SetDataDefinition(*sequence, def);
        if (segment) {
            slot->Remove(*b.p.slotSegment);
            sequence->InsertInto(*b.p.sequenceComponents, 0, *segment);
        }
        slot->SetRef(*b.p.slotSegment, *sequence);
        segment = sequence;
    }
    const auto* components = segment->FindVector(*b.p.sequenceComponents);
    segment->InsertInto(*b.p.sequenceComponents, components ? components->size() : 0, *clip);
}

}  // namespace aafmodel
