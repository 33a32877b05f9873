#pragma once
/// A descriptive marker.
#include "../core/ViewBase.h"
#include "aaf/IAAFDescriptiveMarker.h"

namespace aafmodel {

class DescriptiveMarkerView final : public View<IAAFDescriptiveMarker> {
public:
    using View::View;

    AAFRESULT Initialize() override;
    AAFRESULT SetDescribedSlotIDs(aafUInt32 numberElements, aafUInt32* pDescribedSlotIDs) override;
    AAFRESULT GetDescribedSlotIDs(aafUInt32 numberElements, aafUInt32* pDescribedSlotIDs) override;
    AAFRESULT GetDescribedSlotIDsSize(aafUInt32* numberElements) override;
    AAFRESULT SetDescription(IUnknown* pDescription) override;
    AAFRESULT GetDescription(IUnknown** ppDescription) override;
};

}  // namespace aafmodel
