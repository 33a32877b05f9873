#pragma once
/// What a Source Mob adds: its essence descriptor and physical source references.
#include "../core/ViewBase.h"
#include "aaf/IAAFSourceMob.h"

namespace aafmodel {

class SourceMobView final : public View<IAAFSourceMob> {
public:
    using View::View;

    AAFRESULT Initialize() override;
    AAFRESULT GetEssenceDescriptor(IAAFEssenceDescriptor** ppEssence) override;
    AAFRESULT SetEssenceDescriptor(IAAFEssenceDescriptor* pEssence) override;
    AAFRESULT AddNilReference(aafSlotID_t slotID, aafLength_t length, IAAFDataDef* pDataDef,
                              aafRational_t editRate) override;
    AAFRESULT AppendTimecodeSlot(aafRational_t editrate, aafInt32 slotID, aafTimecode_t startTC,
                                 aafFrameLength_t length32) override;
    AAFRESULT AppendEdgecodeSlot(aafRational_t editrate, aafInt32 slotID, aafFrameOffset_t startEC,
                                 aafFrameLength_t length32, aafFilmType_t filmKind, aafEdgeType_t codeFormat,
                                 aafEdgecode_t header) override;
    AAFRESULT SpecifyValidCodeRange(IAAFDataDef* pEssenceKind, aafSlotID_t slotID, aafRational_t editrate,
                                    aafFrameOffset_t startOffset, aafFrameLength_t length32) override;
    AAFRESULT AppendPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot, IAAFDataDef* pEssenceKind,
                                  aafSourceRef_t ref, aafLength_t srcRefLength) override;
    AAFRESULT NewPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot, IAAFDataDef* pEssenceKind,
                               aafSourceRef_t ref, aafLength_t srcRefLength) override;
    AAFRESULT AddPulldownRef(aafAppendOption_t addType, aafRational_t editrate, aafSlotID_t aMobSlot,
                             IAAFDataDef* pEssenceKind, aafSourceRef_t ref, aafLength_t srcRefLength,
                             aafPulldownKind_t pulldownKind, aafPhaseFrame_t phaseFrame,
                             aafPulldownDir_t direction) override;
};

}  // namespace aafmodel
