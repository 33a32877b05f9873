#pragma once
/// The edit rate and origin of a timeline slot.
#include "../core/ViewBase.h"
#include "aaf/IAAFTimelineMobSlot.h"

namespace aafmodel {

class TimelineMobSlotView final : public View<IAAFTimelineMobSlot> {
public:
    using View::View;

    AAFRESULT Initialize() override;
    AAFRESULT GetEditRate(aafRational_t* pEditRate) override;
    AAFRESULT SetEditRate(aafRational_constref editRate) override;
    AAFRESULT GetOrigin(aafPosition_t* pOrigin) override;
    AAFRESULT SetOrigin(aafPosition_t origin) override;
};

}  // namespace aafmodel
