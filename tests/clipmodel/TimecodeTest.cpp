// Timecode arithmetic: drop-frame counting both ways, rate and drop changes,
// and the conversions between samples and frames.
#include <gtest/gtest.h>

#include <array>

#include "clipmodel/Timecode.h"

namespace {

using namespace Timecode;

/// Days, hours, minutes, seconds, frames.
using Fields = std::array<short, 5>;

Fields Split(timecode_t tc) {
    Fields f{};
    TCDeconstruct(tc, &f[0], &f[1], &f[2], &f[3], &f[4]);
    return f;
}

timecode_t Make(int count, unsigned short fps, bool drop) {
    const timecodeDesc_t desc = TCCreateDesc(drop, fps);
    return TCCreateDur(count, &desc);
}

bool IsDrop(const timecode_t& tc) { return (tc.desc.flags & TCDropFrameFlag) != 0; }

struct CountCase {
    unsigned short fps;
    bool drop;
    int count;
    Fields fields;
};

// Both directions: each count splits into its fields and the fields build the
// count again.
const CountCase kCountCases[] = {
    {30, true, 1799, {0, 0, 0, 59, 29}},  {30, true, 1800, {0, 0, 1, 0, 2}},   {30, true, 3598, {0, 0, 2, 0, 2}},
    {30, true, 17982, {0, 0, 10, 0, 0}},  {30, true, 17983, {0, 0, 10, 0, 1}}, {30, true, 107892, {0, 1, 0, 0, 0}},
    {30, true, 2589408, {1, 0, 0, 0, 0}}, {60, true, 3599, {0, 0, 0, 59, 59}}, {60, true, 3600, {0, 0, 1, 0, 4}},
    {60, true, 35964, {0, 0, 10, 0, 0}},  {30, false, 1800, {0, 0, 1, 0, 0}},  {25, false, 90012, {0, 1, 0, 0, 12}},
};

TEST(Timecode, CountsAndDisplayedFieldsMatchBothWays) {
    for (const CountCase& c : kCountCases) {
        SCOPED_TRACE(testing::Message() << c.fps << (c.drop ? " DF " : " NDF ") << c.count);
        const timecode_t tc = Make(c.count, c.fps, c.drop);
        EXPECT_EQ(Split(tc), c.fields);
        const timecodeDesc_t desc = TCCreateDesc(c.drop, c.fps);
        const Fields& f = c.fields;
        const timecode_t built = TCConstruct(f[0], f[1], f[2], f[3], f[4], &desc);
        EXPECT_EQ(built.count, c.count);
        EXPECT_EQ(IsDrop(built), c.drop);
    }
}

TEST(Timecode, EveryDropFrameCountOfTwoHoursSurvivesTheRoundTrip) {
    for (const unsigned short fps : {30, 60}) {
        const timecodeDesc_t desc = TCCreateDesc(1, fps);
        int mismatches = 0;
        for (int count = 0; count < 2 * 3600 * fps; ++count) {
            const Fields f = Split(TCCreateDur(count, &desc));
            // A drop-frame display never shows the dropped frame numbers.
            if (f[3] == 0 && f[2] % 10 != 0 && f[4] < TCGetNumFramesDroppedPerMinute(fps)) ++mismatches;
            if (TCConstruct(f[0], f[1], f[2], f[3], f[4], &desc).count != count) ++mismatches;
        }
        EXPECT_EQ(mismatches, 0) << fps;
    }
}

TEST(Timecode, RateZeroReadsAsThirtyNonDrop) {
    timecode_t tc{{TCDropFrameFlag, 0, 0, 0}, 1800};
    EXPECT_EQ(Split(tc), (Fields{0, 0, 1, 0, 0}));
    const timecode_t built = TCConstruct(0, 0, 1, 0, 0, nullptr);
    EXPECT_EQ(built.count, 1800);
    EXPECT_EQ(built.desc.fps, 30);
    EXPECT_FALSE(IsDrop(built));
    // Null pointers are passed over.
    TCDeconstruct(tc, nullptr, nullptr, nullptr, nullptr, nullptr);

    // Converting a zero count keeps its rate of 0; only the drop bit goes.
    timecode_t zero{{TCDropFrameFlag, 0, 0, 0}, 0};
    TCConvertFPS(&zero, 25);
    EXPECT_EQ(zero.desc.fps, 0);
    EXPECT_FALSE(IsDrop(zero));
    // Any other count at rate 0 reads as 30 fps, and its frames scale to 25.
    timecode_t other{{0, 0, 0, 0}, 35};
    TCConvertFPS(&other, 25);
    EXPECT_EQ(other.desc.fps, 25);
    EXPECT_EQ(other.count, 25);
}

TEST(Timecode, ConstructionClearsADropBitTheRateCannotHave) {
    const timecodeDesc_t forced{TCDropFrameFlag | 0x10, 25, 7, 9};
    const timecode_t built = TCConstruct(0, 0, 1, 0, 0, &forced);
    EXPECT_EQ(built.count, 1500);
    EXPECT_EQ(built.desc.flags, 0x10u);
    EXPECT_FALSE(TCCreateDesc(1, 25).flags & TCDropFrameFlag);
}

// A change of rate or of drop frame: the new rate or drop flag, then what follows.
struct ChangeCase {
    const char* name;
    timecode_t from;
    unsigned short to;
    int count;
    bool drop;
};

TEST(Timecode, ConvertFPSKeepsTheDisplayAndScalesTheFrames) {
    const ChangeCase cases[] = {
        {"25 to 50 doubles the frames", Make(90012, 25, false), 50, 180024, false},
        {"24 to 30 rounds 28.75 up", Make(23, 24, false), 30, 29, false},
        {"30 DF to 25 drops the flag", Make(1800, 30, true), 25, 1502, false},
        {"60 DF to 30 keeps drop", Make(3600, 60, true), 30, 1800, true},
        {"same rate changes nothing", Make(1800, 30, true), 30, 1800, true},
        {"no value stays", Make(TCNoValue, 30, true), 60, TCNoValue, true},
        {"no value to 25 drops the flag", Make(TCNoValue, 30, true), 25, TCNoValue, false},
        {"to rate 0 counts at 30", Make(25, 25, false), 0, 30, false},
    };
    for (const ChangeCase& c : cases) {
        SCOPED_TRACE(c.name);
        timecode_t tc = c.from;
        TCConvertFPS(&tc, c.to);
        EXPECT_EQ(tc.count, c.count);
        EXPECT_EQ(tc.desc.fps, c.to);
        EXPECT_EQ(IsDrop(tc), c.drop);
    }
}

TEST(Timecode, ChangeDropKeepsTheDisplayedTimecode) {
    const ChangeCase cases[] = {
        {"30 NDF 00:01:00:00 to DF", Make(1800, 30, false), 1, 1798, true},
        {"30 DF 00:01:00:02 to NDF", Make(1800, 30, true), 0, 1802, false},
        {"60 NDF 00:10:00:00 to DF", Make(36000, 60, false), 1, 35964, true},
        {"25 cannot be drop", Make(1500, 25, false), 1, 1500, false},
        {"no value takes the bit alone", Make(TCNoValue, 30, false), 1, TCNoValue, true},
    };
    for (const ChangeCase& c : cases) {
        SCOPED_TRACE(c.name);
        timecode_t tc = c.from;
        TCChangeDrop(&tc, static_cast<unsigned char>(c.to));
        EXPECT_EQ(tc.count, c.count);
        EXPECT_EQ(IsDrop(tc), c.drop);
        EXPECT_EQ(tc.desc.fps, c.from.desc.fps);
    }
}

struct SamplesCase {
    const char* name;
    long long samples;
    double sampleRate, fps;
    int fpsIn;
    bool dropIn;
    int fpsOut;
    bool dropOut;
    int count;  // at fpsOut and dropOut
};

TEST(Timecode, SamplesToTCCountsOneSampleMore) {
    const SamplesCase cases[] = {
        {"last sample of the first second", 47999, 48000, 24, 24, false, 24, false, 24},
        {"one hour at 25", 172800000, 48000, 25, 25, false, 25, false, 90000},
        {"a minute of 29.97 less one frame", 2882877, 48000, 30000.0 / 1001, 30, true, 30, true, 1799},
        {"read at 25, shown at 50", 48000, 48000, 25, 25, false, 50, false, 50},
        {"drop frame in, non-drop out", 2882880, 48000, 30000.0 / 1001, 30, true, 30, false, 1802},
        {"rate 0 in reads at 30", 47999, 48000, 30, 0, true, 30, false, 30},
        {"beyond 32 bits is no value", 1LL << 60, 48000, 25, 25, false, 30, true, TCNoValue},
    };
    for (const SamplesCase& c : cases) {
        SCOPED_TRACE(c.name);
        const timecode_t tc = SamplesToTC(c.samples, c.sampleRate, c.fps, c.fpsIn, c.dropIn, c.fpsOut, c.dropOut);
        EXPECT_EQ(tc.count, c.count);
        EXPECT_EQ(tc.desc.fps, c.fpsOut);
        EXPECT_EQ(IsDrop(tc), c.dropOut);
    }
    // 2882880 samples are 1800 frames at 29.97: 00:01:00:02 in drop frame.
    EXPECT_EQ(Split(SamplesToTC(2882880, 48000, 30000.0 / 1001, 30, 1, 30, 1)), (Fields{0, 0, 1, 0, 2}));
}

TEST(Timecode, TCToSamplesRoundsHalfUp) {
    EXPECT_EQ(TCToSamples(Make(90000, 25, false), 48000, 25), 172800000);
    // 1601.6 samples per frame at 29.97.
    EXPECT_EQ(TCToSamples(Make(1, 30, true), 48000, 30000.0 / 1001), 1602);
}

}  // namespace
