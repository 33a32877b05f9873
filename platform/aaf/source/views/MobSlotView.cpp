#include "MobSlotView.h"

#include "../core/DataDefinition.h"
#include "../core/Schema.h"
#include "../core/WideText.h"
#include "ViewSupport.h"

namespace aafmodel {

AAFRESULT MobSlotView::GetSegment(IAAFSegment** ppResult) {
    return Guarded([&] {
        ModelObject* segment = m_object.GetRef(*Builtins(m_object).p.slotSegment);
        Require(segment, AAFRESULT_PROP_NOT_PRESENT);
        return HandOut(*segment, ppResult);
    });
}

AAFRESULT MobSlotView::SetName(aafCharacter_constptr pName) {
    return Guarded([&] {
        m_object.SetString(*Builtins(m_object).p.slotSlotName, WideArg(pName));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobSlotView::GetName(aafCharacter* pName, aafUInt32 bufSize) {
    return Guarded([&] {
        CopyStringProperty(m_object, *Builtins(m_object).p.slotSlotName, pName, bufSize);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobSlotView::GetNameBufLen(aafUInt32* pBufSize) {
    return Guarded([&] {
        Require(pBufSize);
        *pBufSize = StringPropertyBufLen(m_object, *Builtins(m_object).p.slotSlotName);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobSlotView::GetPhysicalNum(aafUInt32* pResult) {
    return Guarded([&] {
        Require(pResult);
        *pResult = m_object.GetRequired<aafUInt32>(*Builtins(m_object).p.slotPhysicalTrackNumber);
        return AAFRESULT_SUCCESS;
    });
}

// The slot's data definition is that of its segment.
AAFRESULT MobSlotView::GetDataDef(IAAFDataDef** ppResult) {
    return Guarded([&] {
        Require(ppResult);
        ModelObject* segment = m_object.GetRef(*Builtins(m_object).p.slotSegment);
        Require(segment, AAFRESULT_PROP_NOT_PRESENT);
        DataDefinition& def = GetDataDefinition(*segment);
        *ppResult = &def;
        def.AddRef();
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobSlotView::GetSlotID(aafSlotID_t* pResult) {
    return Guarded([&] {
        Require(pResult);
        *pResult = m_object.GetRequired<aafSlotID_t>(*Builtins(m_object).p.slotSlotID);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobSlotView::SetSegment(IAAFSegment* pSegment) {
    return Guarded([&] {
        const BuiltinDefinitions& b = Builtins(m_object);
        m_object.SetRef(*b.p.slotSegment, ObjectArg(pSegment, *b.c.segment));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobSlotView::SetPhysicalNum(aafUInt32 physicalNum) {
    return Guarded([&] {
        m_object.SetFixed(*Builtins(m_object).p.slotPhysicalTrackNumber, physicalNum);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MobSlotView::SetSlotID(aafSlotID_t value) {
    return Guarded([&] {
        m_object.SetFixed(*Builtins(m_object).p.slotSlotID, value);
        m_object.GetSchema().NoteChange();
        return AAFRESULT_SUCCESS;
    });
}

}  // namespace aafmodel
