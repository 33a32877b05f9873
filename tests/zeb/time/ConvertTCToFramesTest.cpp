// Timecodes as frame counts, from numbers and from text.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "StringFixture.h"
#include "TestText.h"
#include "time/ConvertTCToFrames.h"

namespace {

using namespace ZEB;

TEST(ConvertTCToFrames, CountsFromMidnight) {
    struct Case {
        unsigned int h, m, s, f, fps;
        bool drop;
        unsigned int expected;
    };
    const std::vector<Case> cases = {
        {1, 0, 0, 0, 30, true, 107892},      {1, 0, 0, 0, 30, false, 108000},
        {0, 1, 0, 0, 30, true, 1798},  // 00:01:00;00 is skipped in drop counting but not detected
        {0, 10, 0, 0, 30, true, 17982},      {0, 11, 0, 0, 30, true, 19780},
        {0, 59, 59, 29, 30, true, 107891},  // the last frame before the hour
        {10, 23, 45, 12, 30, true, 1121640}, {1, 0, 0, 0, 60, true, 215784},
        {1, 0, 0, 0, 25, true, 90000},    // a rate that drops nothing counts plainly
        {0, 0, 61, 40, 24, false, 1504},  // out-of-range parts are added as they stand
    };
    for (const auto& c : cases) {
        unsigned int out = 0xDEADBEEF;
        EXPECT_EQ(ConvertTCToFrames(c.h, c.m, c.s, c.f, c.fps, c.drop, &out), TOV_OK);
        EXPECT_EQ(out, c.expected) << c.h << ":" << c.m << ":" << c.s << ":" << c.f << " at " << c.fps
                                   << (c.drop ? " drop" : "");
    }
}

class ConvertTCStringToFrames : public StringFixture {};

TEST_F(ConvertTCStringToFrames, ReadsDigitsFromTheEnd) {
    struct Case {
        std::u16string text;
        unsigned int h, m, s, f;
    };
    const std::vector<Case> cases = {
        {u"10:23:45:12", 10, 23, 45, 12},
        {u"10233512", 10, 23, 35, 12},
        {u"1:2", 0, 0, 0, 12},
        {u"123456789", 23, 45, 67, 89},  // digits beyond the eighth are ignored
        {u"TC\u00E9 01\u201300\u201300\u201302", 1, 0, 0, 2},
        {u"", 0, 0, 0, 0},
    };
    for (const auto& c : cases) {
        for (bool drop : {true, false}) {
            ZEBString text(reinterpret_cast<const unsigned short*>(c.text.c_str()));
            unsigned int out = 0xDEADBEEF, expected = 0;
            ZEB::ConvertTCStringToFrames(text.InArg(), 30, drop, out);
            ZEB::ConvertTCToFrames(c.h, c.m, c.s, c.f, 30, drop, &expected);
            EXPECT_EQ(out, expected) << std::string(c.text.begin(), c.text.end()) << (drop ? " drop" : "");
        }
    }
    unsigned int out = 0;
    ExpectThrowsResult([&] { ZEB::ConvertTCStringToFrames(nullptr, 30, true, out); }, ZEB_E_NOTREADY, "null text");
}

}  // namespace
