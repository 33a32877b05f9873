#pragma once
/// A timecode as a frame count from midnight.
#include "tov/ITOVString.h"
#include "tov/TOVResult.h"

namespace ZEB {

/// Writes the frame count into `*out` and returns TOV_OK; `out` must not be null. In drop mode minutes and ten-minute
/// blocks are shortened by the rate's dropped frames; seconds and frames are added as they stand, so labels that
/// drop-frame counting skips are not detected. Unsigned 32-bit arithmetic.
TOVRESULT ConvertTCToFrames(unsigned int hours, unsigned int minutes, unsigned int seconds, unsigned int frames,
                            unsigned int fps, bool drop, unsigned int* out);
/// The same from text: the digits read from the end are frames, seconds,
/// minutes and hours, units before tens; everything else is skipped, digits
/// beyond the eighth are ignored and missing ones count 0. Failures of the
/// string (a null `text` included) are thrown as an `int`.
void ConvertTCStringToFrames(ITOVString* text, unsigned int fps, bool drop, unsigned int& out);

}  // namespace ZEB
