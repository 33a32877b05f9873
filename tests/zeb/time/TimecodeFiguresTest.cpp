// What a rate implies: dropped frames, high rates, the longest clip.
#include <gtest/gtest.h>

#include <vector>

#include "time/GetMaxDuration.h"
#include "time/TCFrameRates.h"

namespace {

using namespace ZEB;

TEST(TimecodeFigures, PerRate) {
    struct Case {
        unsigned int fps, dropped;
        bool high;
        unsigned int low;
        unsigned int maxDrop;  // also the figure without a drop argument
        unsigned int maxNonDrop;
    };
    const std::vector<Case> cases = {
        {24, 0, false, 24, 10368000, 10368000},   {25, 0, false, 25, 10800000, 10800000},
        {29, 0, false, 29, 12528000, 12528000},   {30, 2, false, 30, 12947040, 12960000},
        {50, 0, true, 25, 21600000, 21600000},    {60, 4, true, 30, 25894080, 25920000},
        {120, 8, false, 120, 51788160, 51840000}, {0, 0, false, 0, 0, 0},
    };
    for (const auto& c : cases) {
        EXPECT_EQ(TCGetNumFramesDroppedPerMinute(c.fps), c.dropped) << c.fps;
        EXPECT_EQ(TCFPSIsHighFPS(c.fps), c.high) << c.fps;
        EXPECT_EQ(TCGetCorrespondingLowFPS(c.fps), c.low) << c.fps;
        EXPECT_EQ(GetMaxDuration(c.fps), c.maxDrop) << c.fps;
        EXPECT_EQ(GetMaxDuration(c.fps, true), c.maxDrop) << c.fps;
        EXPECT_EQ(GetMaxDuration(c.fps, false), c.maxNonDrop) << c.fps;
    }
}

}  // namespace
