// Hex dumps, trimming, file names and the TRK keys.
#include <gtest/gtest.h>

#include "clipmodel/TextHelpers.h"

namespace {

using namespace HelperFunctions;

TEST(TextHelpersTest, HexDumpFromMemory) {
    const char bytes[] = {'\x00', '\x0f', '\xa0', '\xff', 'A', 'z'};
    EXPECT_EQ(HexDumpFromMemory(bytes, 6), "000fa0ff417a");
    EXPECT_EQ(HexDumpFromMemory(bytes, 2), "000f");
    EXPECT_EQ(HexDumpFromMemory(bytes, 0), "");
    // An odd length or no data give nothing at all.
    EXPECT_EQ(HexDumpFromMemory(bytes, 5), "");
    EXPECT_EQ(HexDumpFromMemory(nullptr, 4), "");
}

TEST(TextHelpersTest, TrimFromBeginningAndEnd) {
    struct Case {
        const char* text;
        char c;
        const char* trimmed;
    };
    const Case cases[] = {
        {"  Roll 7  ", ' ', "Roll 7"}, {"   ", ' ', ""},        {"", ' ', ""},
        {"\tA\t", ' ', "\tA\t"},       {"xxAxBxx", 'x', "AxB"},
    };
    for (const Case& c : cases) EXPECT_EQ(TrimFromBeginningAndEnd(c.text, c.c), c.trimmed) << c.text;
}

TEST(TextHelpersTest, GetFullFileNameFromPath) {
    struct Case {
        const char* path;
        const char* name;
    };
    const Case cases[] = {
        {"/media/day1/Take7_1.wav", "Take7_1.wav"},
        {"C:\\media\\Take7_1.wav", "Take7_1.wav"},
        {"/media\\mixed/a.wav", "a.wav"},
        {"/media/folder/", ""},
        {"a.wav", "a.wav"},
    };
    for (const Case& c : cases) EXPECT_EQ(GetFullFileNameFromPath(c.path), c.name) << c.path;
}

TEST(TextHelpersTest, IsKeywordTRK) {
    for (const char* key : {"TRK1", "TRK0", "TRK12", "TRK99"}) EXPECT_TRUE(IsKeywordTRK(key)) << key;
    for (const char* key : {"TRK", "TRK123", "TRKa", "TRK1a", "trk1", "TRX1", "TRK-1", "TRK 1", ""}) {
        EXPECT_FALSE(IsKeywordTRK(key)) << key;
    }
}

}  // namespace
