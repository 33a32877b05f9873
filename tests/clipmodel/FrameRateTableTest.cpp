// The look-ups from a figure or a text to a frame rate.
#include <gtest/gtest.h>

#include "StartedLibraryTest.h"
#include "clipmodel/FrameRateTable.h"

namespace {

using namespace HelperFunctions;

struct RateCase {
    double fps;
    int numerator, denominator;
};

::testing::AssertionResult IsRate(const _aafRational_t& rate, int numerator, int denominator) {
    if (rate.numerator == numerator && rate.denominator == denominator) return ::testing::AssertionSuccess();
    return ::testing::AssertionFailure() << rate.numerator << "/" << rate.denominator << " instead of " << numerator
                                         << "/" << denominator;
}

TEST(FrameRateTable, RationalRateFromFPS) {
    // Table rows, searched from the truncated low bound; between rows, and
    // from 100000 up, rounded; three times a frame rate from 69 to under 183,
    // then four times.
    const RateCase cases[] = {{23.0, 24000, 1001}, {24.0, 24, 1},         {59.94, 60000, 1001},   {44100.0, 44100, 1},
                              {26.5, 27, 1},       {100000.0, 100000, 1}, {68.9, 69, 1},          {71.5, 72000, 1001},
                              {182.9, 180, 1},     {183.0, 183, 1},       {119.88, 120000, 1001}, {243.9, 240, 1},
                              {244.0, 244, 1}};
    for (const RateCase& c : cases) {
        _aafRational_t rate{-1, -1};
        RationalRateFromFPS(c.fps, rate);
        EXPECT_TRUE(IsRate(rate, c.numerator, c.denominator)) << c.fps;
    }
    // The whole-number form keeps the same bounds.
    const RateCase videoCases[] = {{23, 24000, 1001}, {68, 68, 1},   {71, 72000, 1001},
                                   {243, 240, 1},     {244, 244, 1}, {-5, -5, 1}};
    for (const RateCase& c : videoCases) {
        _aafRational_t rate{-1, -1};
        RationalVideoRateFromFPS(static_cast<int>(c.fps), rate);
        EXPECT_TRUE(IsRate(rate, c.numerator, c.denominator)) << c.fps;
    }
}

TEST(FrameRateTable, StringToFrameRateReadsTheNumberAndTheDropMark) {
    struct Case {
        const char* text;
        int numerator, denominator;
        bool drop;
    };
    // Only the first "DF" is looked at; a rate that cannot be drop frame ignores the mark.
    const Case cases[] = {{"29", 30000, 1001, false},       {"29.97DF", 30000, 1001, true},
                          {"29.97df", 30000, 1001, true},   {"29.97ND", 30000, 1001, false},
                          {"29.97NDF", 30000, 1001, false}, {"29.97 ndf", 30000, 1001, false},
                          {"30NDFDF", 30, 1, false},        {"30DF", 30, 1, true},
                          {"59.94DF", 60000, 1001, true},   {"25DF", 25, 1, false},
                          {"025.000-ND", 25, 1, false}};
    for (const Case& c : cases) {
        SCOPED_TRACE(c.text);
        _aafRational_t rate{-1, -1};
        bool drop = !c.drop;
        ASSERT_TRUE(StringToFrameRate(c.text, rate, drop));
        EXPECT_TRUE(IsRate(rate, c.numerator, c.denominator));
        EXPECT_EQ(drop, c.drop);
    }
}

TEST(FrameRateTable, StringToFrameRateRefusesOtherNumbersAndWritesNothing) {
    for (const char* text : {"48", "61", "0", "", "DF29.97", "1e300"}) {
        SCOPED_TRACE(text);
        _aafRational_t rate{7, 9};
        bool drop = true;
        EXPECT_FALSE(StringToFrameRate(text, rate, drop));
        EXPECT_TRUE(IsRate(rate, 7, 9));
        EXPECT_TRUE(drop);
    }
}

using VideoFormatName = StartedLibraryTest;

TEST_F(VideoFormatName, StringToFrameRateFindsOnlyTheExactName) {
    struct Case {
        const char* text;
        unsigned short fps;
        bool interlaced;
    };
    const Case cases[] = {{"29.97i", 30, true}, {"59.94p", 30, false}, {"50p", 25, false}};
    for (const Case& c : cases) {
        SCOPED_TRACE(c.text);
        unsigned short fps = 0;
        bool interlaced = !c.interlaced;
        ASSERT_TRUE(StringToFrameRate(Text(c.text), &fps, &interlaced));
        EXPECT_EQ(fps, c.fps);
        EXPECT_EQ(interlaced, c.interlaced);
    }
    for (const char* text : {"50P", "25", " 25p", "60p"}) {
        SCOPED_TRACE(text);
        unsigned short fps = 99;
        bool interlaced = true;
        EXPECT_FALSE(StringToFrameRate(Text(text), &fps, &interlaced));
        EXPECT_EQ(fps, 99);
        EXPECT_TRUE(interlaced);
    }
}

}  // namespace
