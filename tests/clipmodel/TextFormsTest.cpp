// The diagnostic text forms, with the orders they keep, the displayed form of
// a start timecode, and the parses and conversions between timecode forms.
#include <gtest/gtest.h>

#include <array>
#include <climits>

#include "StartedLibraryTest.h"
#include "clipmodel/TextForms.h"

namespace {

using namespace OrloReader;

// Numbers print as signed, rationals denominator first, Mob IDs without label
// bytes 6 to 11, and time stamps with the year in the day's place.
TEST(DiagnosticText, KeepsItsOwnOrders) {
    EXPECT_EQ(ToString(ULLONG_MAX), "-1");
    EXPECT_EQ(ToString(_aafRational_t{30000, 1001}), "1001/30000");
    _aafMobID_t id{};
    const unsigned char label[12] = {0x06, 0x0A, 0x2B, 0x34, 0x01, 0x01, 0xEE, 0xEE, 0xEE, 0xEE, 0xEE, 0xEE};
    std::copy(label, label + 12, id.SMPTELabel);
    id.length = 0x13;
    id.instanceHigh = 0xB1;
    id.instanceMid = 0x02;
    id.instanceLow = 0xA1;
    id.material = {0x12345678, 0x9ABC, 0xDEF0, {1, 2, 3, 4, 5, 6, 7, 0xFF}};
    EXPECT_EQ(ToString(id),
              "060A2B340101"
              "13B102A1"
              "12345678"
              "9ABC"
              "DEF0"
              "01020304050607FF");
    _aafTimeStamp_t stamp{};
    stamp.date = {2016, 3, 7};
    stamp.time = {9, 5, 1, 42};
    EXPECT_EQ(ToString(stamp), "2016-03-2016T09:05:01+00:00");
}

TEST(TimeCodeInfoText, MarksDropFrameAndOddHalvesOnlyInItsOwnForm) {
    const struct {
        TimeCodeInfo info;
        const char* text;
    } cases[] = {
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
    for (const auto& c : cases) {
        std::string text = "previous";
        c.info.ToString(text);
        EXPECT_EQ(text, c.text);
    }
    // The diagnostic form always has colons and every frame.
    EXPECT_EQ(ToString(TimeCodeInfo(1, 2, 3, 5, 60, true)), "01:02:03:05");
}

using UIDText = StartedLibraryTest;
using TimecodeText = StartedLibraryTest;

TEST_F(UIDText, ReadsBackAndKeepsZeroWhereTheTextStops) {
    const _tovUID uid{0x12345678, 0x9ABC, 0xDEF0, {0x01, 0x02, 0x03, 0x04, 0x05, 0x06, 0x07, 0xFF}};
    const std::string text = ToString(uid);
    EXPECT_EQ(text, "urn:uuid:12345678-9abc-def0-0102-0304050607ff");
    EXPECT_EQ(StringToUID(Text(text.c_str())), uid);
    EXPECT_EQ(StringToUID(Text("urn:uuid:12345678-9ABC-DEF0-0102-0304050607FF")), uid);
    EXPECT_EQ(StringToUID(Text("urn:uuid:12345678-9abc")), (_tovUID{0x12345678, 0x9ABC, 0, {}}));
    EXPECT_EQ(StringToUID(Text("uuid:12345678")), _tovUID{});
}

TEST_F(TimecodeText, FillsFromTheRight) {
    struct Case {
        const char* text;
        int hours, minutes, seconds, frames;
    };
    const Case cases[] = {
        {"02:03:04", 0, 2, 3, 4},
        // Digits are paired from the end, whatever the separators say.
        {"1:2:3:4", 0, 0, 12, 34},
        {"12345678901", 45, 67, 89, 1},
        {"TC 23:59:59:29 end", 23, 59, 59, 29},
        {"no digits", 0, 0, 0, 0},
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(c.text);
        const TimeCodeInfo info = StringToTimecode(Text(c.text));
        EXPECT_EQ((std::array<int, 4>{info.GetHours(), info.GetMinutes(), info.GetSeconds(), info.GetFrames()}),
                  (std::array<int, 4>{c.hours, c.minutes, c.seconds, c.frames}));
        EXPECT_EQ(info.GetFPS(), 0);
        EXPECT_FALSE(info.IsDropFrame());
        EXPECT_EQ(info.GetTotalFrames(), -1);
    }
}

TEST(TimeCodeToTimeCodeInfo, KeepsTheCount) {
    const Timecode::timecodeDesc_t drop = Timecode::TCCreateDesc(1, 30);
    TimeCodeInfo info;
    TimeCodeToTimeCodeInfo(Timecode::TCCreateDur(1800, &drop), info);
    std::string text;
    info.ToString(text);
    EXPECT_EQ(text, "00;01;00;02");
    EXPECT_EQ(info.GetFPS(), 30);
    EXPECT_EQ(info.GetTotalFrames(), 1800);

    // Days are dropped; the count keeps them.
    const Timecode::timecodeDesc_t plain = Timecode::TCCreateDesc(0, 25);
    TimeCodeToTimeCodeInfo(Timecode::TCCreateDur(25 * 86400 + 26, &plain), info);
    info.ToString(text);
    EXPECT_EQ(text, "00:00:01:01");
    EXPECT_FALSE(info.IsDropFrame());
    EXPECT_EQ(info.GetTotalFrames(), 25 * 86400 + 26);
}

TEST(TimeToSamples, Truncates) {
    unsigned long long samples = 0;
    TimeToSamples(1, 2, 3, 48000, samples);
    EXPECT_EQ(samples, 3723ull * 48000);
    TimeToSamples(0, 0, 3, 0.75, samples);
    EXPECT_EQ(samples, 2ull);
}

}  // namespace
