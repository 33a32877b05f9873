#include "time/GetMaxDuration.h"

#include "time/TCFrameRates.h"

namespace ZEB {

unsigned int GetMaxDuration(unsigned int fps) { return GetMaxDuration(fps, true); }

unsigned int GetMaxDuration(unsigned int fps, bool drop) {
    if (!drop) return fps * 432000;
    const unsigned int dropped = TCGetNumFramesDroppedPerMinute(fps);
    // What one ten-minute block holds in drop-frame counting, 720 times.
    return ((fps * 60 - dropped) * 10 + dropped) * 720;
}

}  // namespace ZEB
