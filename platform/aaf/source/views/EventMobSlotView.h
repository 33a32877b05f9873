#pragma once
/// The edit rate of an event slot.
#include "../core/ViewBase.h"
#include "aaf/IAAFEventMobSlot.h"

namespace aafmodel {

class EventMobSlotView final : public View<IAAFEventMobSlot> {
public:
    using View::View;

    AAFRESULT GetEditRate(aafRational_t* pEditRate) override;
    AAFRESULT SetEditRate(aafRational_t* pEditRate) override;
};

}  // namespace aafmodel
