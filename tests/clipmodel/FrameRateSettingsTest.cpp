// A frame rate's three ways in, and its drop-frame rule: the request holds
// only when the rate rounded to whole frames can be drop frame.
#include <gtest/gtest.h>

#include <cmath>

#include "clipmodel/FrameRateSettings.h"

namespace {

using OrloReader::FrameRateSettings;

struct Case {
    const char* name;
    FrameRateSettings settings;
    int numerator, denominator;
    double fps;
    bool drop;
};

TEST(FrameRateSettings, EachWayInSetsRateFpsAndDrop) {
    const Case cases[] = {
        {"rational 29.97 drop", FrameRateSettings(_aafRational_t{30000, 1001}, true), 30000, 1001, 30000.0 / 1001,
         true},
        {"rational 23.976 drop refused", FrameRateSettings(_aafRational_t{24000, 1001}, true), 24000, 1001,
         24000.0 / 1001, false},
        {"floating 29.97 drop", FrameRateSettings(29.97, true), 30000, 1001, 29.97, true},
        // The rate is 59.94 but the figure rounds to 59: no drop frame.
        {"floating 59.4 drop refused", FrameRateSettings(59.4, true), 60000, 1001, 59.4, false},
        // 29 is read as 29.97, which rounds to 30.
        {"integer 29 drop", FrameRateSettings(29, true), 30000, 1001, 30000.0 / 1001, true},
        {"denominator 0", FrameRateSettings(_aafRational_t{30, 0}, true), 30, 0, HUGE_VAL, false},
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(c.name);
        const _aafRational_t rate = c.settings.GetRationalFramerate();
        EXPECT_EQ(rate.numerator, c.numerator);
        EXPECT_EQ(rate.denominator, c.denominator);
        EXPECT_DOUBLE_EQ(c.settings.GetFloatingFrameRate(), c.fps);
        EXPECT_EQ(c.settings.GetDropFrame(), c.drop);
    }
}

TEST(FrameRateSettings, SetDropFrameStandsAloneButSettersApplyTheRule) {
    FrameRateSettings settings(_aafRational_t{30000, 1001}, true);
    settings.SetFloatingFramerate(25.0, true);
    EXPECT_EQ(settings.GetRationalFramerate().numerator, 25);
    EXPECT_FALSE(settings.GetDropFrame());
    settings.SetDropFrame(true);
    EXPECT_TRUE(settings.GetDropFrame());
}

}  // namespace
