#include "TimelineMobSlotView.h"

#include "../core/Schema.h"
#include "ViewSupport.h"

namespace aafmodel {

AAFRESULT TimelineMobSlotView::Initialize() {
    return Guarded([&] {
        m_object.MarkInitialized();
        m_object.SetFixed(*Builtins(m_object).p.timelineOrigin, aafPosition_t{0});
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TimelineMobSlotView::GetEditRate(aafRational_t* pEditRate) {
    return Guarded([&] {
        Require(pEditRate);
        *pEditRate = m_object.GetRequired<aafRational_t>(*Builtins(m_object).p.timelineEditRate);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TimelineMobSlotView::SetEditRate(aafRational_constref editRate) {
    return Guarded([&] {
        m_object.SetFixed(*Builtins(m_object).p.timelineEditRate, editRate);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TimelineMobSlotView::GetOrigin(aafPosition_t* pOrigin) {
    return Guarded([&] {
        Require(pOrigin);
        *pOrigin = m_object.GetRequired<aafPosition_t>(*Builtins(m_object).p.timelineOrigin);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TimelineMobSlotView::SetOrigin(aafPosition_t origin) {
    return Guarded([&] {
        m_object.SetFixed(*Builtins(m_object).p.timelineOrigin, origin);
        return AAFRESULT_SUCCESS;
    });
}

}  // namespace aafmodel
