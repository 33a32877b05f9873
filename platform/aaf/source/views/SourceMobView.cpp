#include "SourceMobView.h"

#include "../core/Schema.h"
#include "MobSlots.h"
#include "ViewSupport.h"

namespace aafmodel {

AAFRESULT SourceMobView::Initialize() {
    return Guarded([&] {
        InitializeMob(m_object);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT SourceMobView::GetEssenceDescriptor(IAAFEssenceDescriptor** ppEssence) {
    return Guarded([&] {
        ModelObject* descriptor = m_object.GetRef(*Builtins(m_object).p.sourceMobEssenceDescription);
        Require(descriptor, AAFRESULT_PROP_NOT_PRESENT);
        return HandOut(*descriptor, ppEssence);
    });
}

AAFRESULT SourceMobView::SetEssenceDescriptor(IAAFEssenceDescriptor* pEssence) {
    return Guarded([&] {
        const BuiltinDefinitions& b = Builtins(m_object);
        m_object.SetRef(*b.p.sourceMobEssenceDescription, ObjectArg(pEssence, *b.c.essenceDescriptor));
        return AAFRESULT_SUCCESS;
    });
}

// A clip that refers to no Mob ends the chain of sources.
AAFRESULT SourceMobView::AddNilReference(aafSlotID_t slotID, aafLength_t length, IAAFDataDef* pDataDef,
                                         aafRational_t editRate) {
    return Guarded([&] {
        const aafSourceRef_t nil{};
        aafmodel::NewPhysSourceRef(m_object, editRate, slotID, pDataDef, nil, length);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT SourceMobView::AppendTimecodeSlot(aafRational_t, aafInt32, aafTimecode_t, aafFrameLength_t) {
    return AAFRESULT_NOT_IMPLEMENTED;
}
AAFRESULT SourceMobView::AppendEdgecodeSlot(aafRational_t, aafInt32, aafFrameOffset_t, aafFrameLength_t, aafFilmType_t,
                                            aafEdgeType_t, aafEdgecode_t) {
    return AAFRESULT_NOT_IMPLEMENTED;
}
AAFRESULT SourceMobView::SpecifyValidCodeRange(IAAFDataDef*, aafSlotID_t, aafRational_t, aafFrameOffset_t,
                                               aafFrameLength_t) {
    return AAFRESULT_NOT_IMPLEMENTED;
}

AAFRESULT SourceMobView::AppendPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot, IAAFDataDef* pEssenceKind,
                                             aafSourceRef_t ref, aafLength_t srcRefLength) {
    return Guarded([&] {
        aafmodel::AppendPhysSourceRef(m_object, editrate, aMobSlot, pEssenceKind, ref, srcRefLength);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT SourceMobView::NewPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot, IAAFDataDef* pEssenceKind,
                                          aafSourceRef_t ref, aafLength_t srcRefLength) {
    return Guarded([&] {
        aafmodel::NewPhysSourceRef(m_object, editrate, aMobSlot, pEssenceKind, ref, srcRefLength);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT SourceMobView::AddPulldownRef(aafAppendOption_t, aafRational_t, aafSlotID_t, IAAFDataDef*, aafSourceRef_t,
                                        aafLength_t, aafPulldownKind_t, aafPhaseFrame_t, aafPulldownDir_t) {
    return AAFRESULT_NOT_IMPLEMENTED;
}

}  // namespace aafmodel
