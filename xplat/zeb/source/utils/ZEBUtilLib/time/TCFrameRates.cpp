#include "time/TCFrameRates.h"

namespace ZEB {

unsigned int TCGetNumFramesDroppedPerMinute(unsigned int fps) {
    switch (fps) {
        case 30:
            return 2;
        case 60:
            return 4;
        case 120:
            return 8;
        default:
            return 0;
    }
}

bool TCFPSIsHighFPS(unsigned int fps) { return fps == 50 || fps == 60; }

unsigned int TCGetCorrespondingLowFPS(unsigned int fps) {
    switch (fps) {
        case 60:
            return 30;
        case 50:
            return 25;
        default:
            return fps;
    }
}

}  // namespace ZEB
