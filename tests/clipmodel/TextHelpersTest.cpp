// Hex dumps, trimming, file names, the TRK keys, and truncation of doubles
// that is defined for every value.
#include <gtest/gtest.h>

#include <cmath>
#include <cstdint>

#include "clipmodel/TextHelpers.h"
#include "clipmodel/TruncateToInteger.h"

namespace {

using namespace HelperFunctions;

TEST(HexDumpFromMemory, WritesPairsOfDigits) {
    const char bytes[] = {'\x00', '\x0f', '\xa0', '\xff', 'A', 'z'};
    EXPECT_EQ(HexDumpFromMemory(bytes, 6), "000fa0ff417a");
    // An odd length or no data give nothing at all.
    EXPECT_EQ(HexDumpFromMemory(bytes, 5), "");
    EXPECT_EQ(HexDumpFromMemory(nullptr, 4), "");
}

TEST(TrimFromBeginningAndEnd, TrimsOnlyTheGivenCharacter) {
    struct Case {
        const char* text;
        char c;
        const char* trimmed;
    };
    const Case cases[] = {
        {"  Roll 7  ", ' ', "Roll 7"}, {"   ", ' ', ""}, {"\tA\t", ' ', "\tA\t"}, {"xxAxBxx", 'x', "AxB"}};
    for (const Case& c : cases) EXPECT_EQ(TrimFromBeginningAndEnd(c.text, c.c), c.trimmed) << c.text;
}

TEST(GetFullFileNameFromPath, TakesEitherSlash) {
    struct Case {
        const char *path, *name;
    };
    const Case cases[] = {{"/media/day1/Take7_1.wav", "Take7_1.wav"},
                          {"C:\\media\\Take7_1.wav", "Take7_1.wav"},
                          {"/media\\mixed/a.wav", "a.wav"},
                          {"/media/folder/", ""}};
    for (const Case& c : cases) EXPECT_EQ(GetFullFileNameFromPath(c.path), c.name) << c.path;
}

TEST(IsKeywordTRK, WantsOneOrTwoDigits) {
    for (const char* key : {"TRK0", "TRK99"}) EXPECT_TRUE(IsKeywordTRK(key)) << key;
    for (const char* key : {"TRK", "TRK123", "TRK1a", "trk1", "TRX1", "TRK-1"}) EXPECT_FALSE(IsKeywordTRK(key)) << key;
}

TEST(TruncateToInteger, TowardsZeroInRangeLowestOutside) {
    EXPECT_EQ(TruncateToInt32(-2.9), -2);
    EXPECT_EQ(TruncateToInt32(2147483647.9), INT32_MAX);
    EXPECT_EQ(TruncateToInt32(2147483648.0), INT32_MIN);
    EXPECT_EQ(TruncateToInt32(-2147483649.0), INT32_MIN);
    EXPECT_EQ(TruncateToInt32(std::nan("")), INT32_MIN);
    EXPECT_EQ(TruncateToInt64(-7.5), -7);
    EXPECT_EQ(TruncateToInt64(9223372036854775808.0), INT64_MIN);
    EXPECT_EQ(TruncateToInt64(-HUGE_VAL), INT64_MIN);
}

}  // namespace
