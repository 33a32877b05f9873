#pragma once
/// A component that can fill a slot.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFSegment : public IUnknown {
public:
    virtual AAFRESULT SegmentOffsetToTC(aafPosition_t* pOffset, aafTimecode_t* pTimecode, aafBool* pFound) = 0;
    virtual AAFRESULT SegmentTCToOffset(aafTimecode_t* pTimecode, aafRational_t* pEditRate, aafFrameOffset_t* pOffset,
                                        aafBool* pFound) = 0;

protected:
    ~IAAFSegment() = default;
};
AAF_INTERFACE_ID(IAAFSegment);
