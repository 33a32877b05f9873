// The helpers of the group scan: the channel number of a numbered-suffix file
// name, and the order of track-name keys with what it does inside a map: keys
// are equal by number, and a key that is not all digits after its prefix is
// equal to whatever it meets first.
#include <gtest/gtest.h>

#include <stdexcept>

#include "grouping/ConvertAlphaIndexToNumber.h"
#include "grouping/TrackIndexFromFileName.h"
#include "grouping/TrkComparsion.h"

namespace {

using namespace HelperFunctions;
using VTImportGrouping::TrackIndexFromFileName;

std::string Keys(const TrkMap& map) {
    std::string keys;
    for (const auto& entry : map) keys += entry.first + "=" + entry.second + " ";
    return keys;
}

TEST(TrkComparsion, ComparesTheNumberAfterThreeCharacters) {
    const struct {
        const char* a;
        const char* b;
        bool less;
    } cases[] = {{"TRK2", "TRK1", false}, {"TRK2", "TRK10", true},  {"TRK01", "TRK1", false}, {"TRK1", "TRK01", false},
                 {"ABC1", "TRK2", true},  {"TRK", "TRK0", false},   {"TRK", "TRK1", true},    {"TRKa", "TRK1", false},
                 {"TRK1", "TRKa", false}, {"TRK1 ", "TRK2", false}, {"", "TRK1", false},      {"", "AB", false}};
    for (const auto& c : cases) EXPECT_EQ(TrkComparsion(c.a, c.b), c.less) << c.a << " < " << c.b;
}

TEST(TrkComparsion, KeyShorterThanThreeCharactersThrows) {
    EXPECT_THROW(TrkComparsion("AB", "TRK1"), std::out_of_range);
    EXPECT_THROW(TrkComparsion("TRK1", "T"), std::out_of_range);
}

TEST(TrkComparsion, MapOrdersByNumberAndMergesEquivalentKeys) {
    TrkMap map;
    map["TRK10"] = "Boom";
    map["TRK2"] = "Lav";
    map["TRK1"] = "Mix";
    EXPECT_EQ(Keys(map), "TRK1=Mix TRK2=Lav TRK10=Boom ");

    // Same number, other spelling: the key first inserted stays.
    EXPECT_FALSE(map.insert({"TRK01", "Other"}).second);
    map["ABC10"] = "Plant";
    EXPECT_EQ(Keys(map), "TRK1=Mix TRK2=Lav TRK10=Plant ");
}

TEST(ConvertAlphaIndexToNumber, ReturnsNothingWhateverItIsGiven) {
    EXPECT_TRUE(ConvertAlphaIndexToNumber({{"TRKa", "Boom"}, {"TRK1", "Mix"}}).empty());
}

TEST(TrackIndexFromFileName, AcceptsOneOrTwoCharactersThatReadAsOneToSixtyFour) {
    // 0 for a name that is refused and leaves the index as it was.
    const struct {
        const char* name;
        int index;
    } cases[] = {{"Take7_12.wav", 12}, {"Take7-3.wav", 3},   {"Take 4.wav", 4},
                 {"a_01.wav", 1},      {"Take7_64.wav", 64}, {"Take7_1a.wav", 1},
                 {"Take7_+3.wav", 3},  {"Take_7.1", 7},      {"", 0},
                 {"Take7.wav", 0},     {"Take7_1", 0},       {"Take7_123.wav", 0},
                 {"Take7_0.wav", 0},   {"Take7_65.wav", 0},  {"Take7_.wav", 0},
                 {"Take7_00.wav", 0},  {"a_1.b-c", 0},       {"Take_1.L.wav", 0},
                 {"Take7_a1.wav", 0}};
    for (const auto& c : cases) {
        int index = 42;
        EXPECT_EQ(TrackIndexFromFileName(c.name, index), c.index != 0) << c.name;
        EXPECT_EQ(index, c.index != 0 ? c.index : 42) << c.name;
    }
}

}  // namespace
