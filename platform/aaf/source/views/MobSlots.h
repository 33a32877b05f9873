#pragma once
/// Slot work shared by the Mob views: finding slots, making timeline slots
/// and source clips, and the physical source references.
#include "../core/ModelObject.h"
#include "aaf/AAFForward.h"

namespace aafmodel {

class DataDefinition;

/// The slot with `slotID`, or null.
ModelObject* FindSlot(const ModelObject& mob, aafSlotID_t slotID);
/// Appends a new timeline slot holding `segment`; `name` may be null.
ModelObject& AppendTimelineSlot(ModelObject& mob, const aafRational_t& editRate, ModelObject& segment,
                                aafSlotID_t slotID, aafCharacter_constptr name, aafPosition_t origin);
/// A new source clip of `def` and `length` that refers to `ref`.
RefPtr<ModelObject> NewSourceClip(const ModelObject& anyOfFile, const DataDefinition& def, aafLength_t length,
                                  const aafSourceRef_t& ref);
/// The published NewPhysSourceRef: the slot `slotID` is made when missing,
/// and its segment becomes a source clip with `ref`.
void NewPhysSourceRef(ModelObject& mob, const aafRational_t& editRate, aafSlotID_t slotID, IAAFDataDef* pDataDef,
                      const aafSourceRef_t& ref, aafLength_t length);
/// The published AppendPhysSourceRef: like NewPhysSourceRef, but a slot that
/// exists gets the clip appended to its sequence (made when it has none).
void AppendPhysSourceRef(ModelObject& mob, const aafRational_t& editRate, aafSlotID_t slotID, IAAFDataDef* pDataDef,
                         const aafSourceRef_t& ref, aafLength_t length);

}  // namespace aafmodel
