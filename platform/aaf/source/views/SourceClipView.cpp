#include "SourceClipView.h"

#include "../core/Schema.h"
#include "ViewSupport.h"

namespace aafmodel {

AAFRESULT SourceClipView::Initialize(IAAFDataDef* pDataDef, aafLength_constref length, aafSourceRef_t sourceRef) {
    return Guarded([&] {
        DataDefinition& def = DataDefArg(pDataDef);
        m_object.MarkInitialized();
        SetDataDefinition(m_object, def);
        m_object.SetFixed(*Builtins(m_object).p.componentLength, length);
        return SetSourceReference(sourceRef);
    });
}

AAFRESULT SourceClipView::GetFade(aafLength_t*, aafFadeType_t*, aafBool*, aafLength_t*, aafFadeType_t*, aafBool*) {
    return AAFRESULT_NOT_IMPLEMENTED;
}

AAFRESULT SourceClipView::ResolveRef(IAAFMob**) { return AAFRESULT_NOT_IMPLEMENTED; }

AAFRESULT SourceClipView::GetSourceReference(aafSourceRef_t* pSourceRef) {
    return Guarded([&] {
        Require(pSourceRef);
        const BuiltinDefinitions& b = Builtins(m_object);
        aafSourceRef_t ref{};
        m_object.GetFixed(*b.p.sourceRefSourceID, ref.sourceID);  // absent: the nil reference
        ref.sourceSlotID = m_object.GetRequired<aafSlotID_t>(*b.p.sourceRefSourceMobSlotID);
        m_object.GetFixed(*b.p.sourceClipStartTime, ref.startTime);
        *pSourceRef = ref;
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT SourceClipView::SetFade(aafInt32, aafFadeType_t, aafInt32, aafFadeType_t) {
    return AAFRESULT_NOT_IMPLEMENTED;
}

AAFRESULT SourceClipView::SetSourceReference(aafSourceRef_t sourceRef) {
    return Guarded([&] {
        const BuiltinDefinitions& b = Builtins(m_object);
        m_object.SetFixed(*b.p.sourceRefSourceID, sourceRef.sourceID);
        m_object.SetFixed(*b.p.sourceRefSourceMobSlotID, sourceRef.sourceSlotID);
        m_object.SetFixed(*b.p.sourceClipStartTime, sourceRef.startTime);
        return AAFRESULT_SUCCESS;
    });
}

}  // namespace aafmodel
