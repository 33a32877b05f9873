// The displayed form of a start timecode: drop-frame separators and the
// frame pairs of the high rates.
#include <gtest/gtest.h>

#include "clipmodel/TimeCodeInfo.h"

namespace {

using OrloReader::TimeCodeInfo;

TEST(TimeCodeInfoTest, ToStringMarksDropFrameAndOddHalves) {
    struct Case {
        TimeCodeInfo info;
        const char* text;
    };
    const Case cases[] = {
        {TimeCodeInfo(1, 2, 3, 4, 25, false), "01:02:03:04"},
        {TimeCodeInfo(1, 2, 3, 4, 30, true), "01;02;03;04"},
        // 48, 50 and 60 fps show frame pairs; the odd frame of a pair gets
        // "." or, in drop frame, ",".
        {TimeCodeInfo(1, 2, 3, 4, 50, false), "01:02:03:02"},
        {TimeCodeInfo(1, 2, 3, 5, 50, false), "01:02:03.02"},
        {TimeCodeInfo(1, 2, 3, 59, 48, false), "01:02:03.29"},
        {TimeCodeInfo(1, 2, 3, 4, 60, true), "01;02;03;02"},
        {TimeCodeInfo(1, 2, 3, 5, 60, true), "01;02;03,02"},
        // Odd frames at an ordinary rate are shown as they are.
        {TimeCodeInfo(0, 0, 0, 5, 24, false), "00:00:00:05"},
    };
    for (const Case& c : cases) {
        std::string text = "previous";
        c.info.ToString(text);
        EXPECT_EQ(text, c.text);
    }
}

}  // namespace
