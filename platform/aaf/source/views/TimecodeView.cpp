#include "TimecodeView.h"

#include "../core/Schema.h"
#include "ViewSupport.h"
#include "aaf/AAFDataDefs.h"

namespace aafmodel {

namespace {
void Store(ModelObject& timecode, const aafTimecode_t& tc) {
    const BuiltinDefinitions& b = Builtins(timecode);
    timecode.SetFixed(*b.p.timecodeStart, tc.startFrame);
    timecode.SetFixed(*b.p.timecodeFPS, tc.fps);
    timecode.SetFixed(*b.p.timecodeDrop, tc.drop ? kAAFTrue : kAAFFalse);
}
}  // namespace

AAFRESULT TimecodeView::Initialize(aafLength_t length, aafTimecode_t* pTimecode) {
    return Guarded([&] {
        Require(pTimecode);
        m_object.MarkInitialized();
        const BuiltinDefinitions& b = Builtins(m_object);
        Store(m_object, *pTimecode);
        m_object.SetFixed(*b.p.componentLength, length);
        if (DataDefinition* def = m_object.GetSchema().FindDataDef(kAAFDataDef_Timecode))
            SetDataDefinition(m_object, *def);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TimecodeView::GetTimecode(aafTimecode_t* pTimecode) {
    return Guarded([&] {
        Require(pTimecode);
        const BuiltinDefinitions& b = Builtins(m_object);
        pTimecode->startFrame = m_object.GetRequired<aafPosition_t>(*b.p.timecodeStart);
        pTimecode->fps = m_object.GetRequired<aafUInt16>(*b.p.timecodeFPS);
        pTimecode->drop = m_object.GetRequired<aafBool>(*b.p.timecodeDrop);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TimecodeView::SetTimecode(aafTimecode_t* pTimecode) {
    return Guarded([&] {
        Require(pTimecode);
        Store(m_object, *pTimecode);
        return AAFRESULT_SUCCESS;
    });
}

}  // namespace aafmodel
