#pragma once
/// The timecode conversions of a segment, which this library does not offer.
#include "../core/ViewBase.h"
#include "aaf/IAAFSegment.h"

namespace aafmodel {

class SegmentView final : public View<IAAFSegment> {
public:
    using View::View;

    AAFRESULT SegmentOffsetToTC(aafPosition_t* pOffset, aafTimecode_t* pTimecode, aafBool* pFound) override;
    AAFRESULT SegmentTCToOffset(aafTimecode_t* pTimecode, aafRational_t* pEditRate, aafFrameOffset_t* pOffset,
                                aafBool* pFound) override;
};

}  // namespace aafmodel
