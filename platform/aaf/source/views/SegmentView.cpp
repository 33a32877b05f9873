#include "SegmentView.h"

namespace aafmodel {

// Timecode conversion over segments is not part of this library.
AAFRESULT SegmentView::SegmentOffsetToTC(aafPosition_t*, aafTimecode_t*, aafBool*) { return AAFRESULT_NOT_IMPLEMENTED; }

AAFRESULT SegmentView::SegmentTCToOffset(aafTimecode_t*, aafRational_t*, aafFrameOffset_t*, aafBool*) {
    return AAFRESULT_NOT_IMPLEMENTED;
}

}  // namespace aafmodel
