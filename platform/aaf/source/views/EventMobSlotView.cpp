#include "EventMobSlotView.h"

#include "../core/Schema.h"
#include "ViewSupport.h"

namespace aafmodel {

AAFRESULT EventMobSlotView::GetEditRate(aafRational_t* pEditRate) {
    return Guarded([&] {
        Require(pEditRate);
        *pEditRate = m_object.GetRequired<aafRational_t>(*Builtins(m_object).p.eventSlotEditRate);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT EventMobSlotView::SetEditRate(aafRational_t* pEditRate) {
    return Guarded([&] {
        Require(pEditRate);
        m_object.SetFixed(*Builtins(m_object).p.eventSlotEditRate, *pEditRate);
        return AAFRESULT_SUCCESS;
    });
}

}  // namespace aafmodel
