// The order of track-name keys, and what it does inside a map: keys are equal
// by number, and a key that is not all digits after its prefix is equal to
// whatever it meets first.
#include <gtest/gtest.h>

#include <stdexcept>

#include "grouping/ConvertAlphaIndexToNumber.h"
#include "grouping/TrkComparsion.h"

namespace {

using namespace HelperFunctions;

std::string Keys(const TrkMap& map) {
    std::string keys;
    for (const auto& entry : map) keys += entry.first + "=" + entry.second + " ";
    return keys;
}

TEST(TrkComparsionTest, ComparesTheNumberAfterThreeCharacters) {
    struct Case {
        const char* a;
        const char* b;
        bool less;
    };
    const Case cases[] = {
        {"TRK1", "TRK2", true},   {"TRK2", "TRK1", false},  {"TRK2", "TRK10", true}, {"TRK9", "TRK10", true},
        {"TRK01", "TRK1", false}, {"TRK1", "TRK01", false}, {"ABC1", "TRK2", true},  {"TRK", "TRK0", false},
        {"TRK", "TRK1", true},    {"TRKa", "TRK1", false},  {"TRK1", "TRKa", false}, {"TRK1 ", "TRK2", false},
        {"", "TRK1", false},      {"TRK1", "", false},      {"", "AB", false},
    };
    for (const Case& c : cases) EXPECT_EQ(TrkComparsion(c.a, c.b), c.less) << c.a << " < " << c.b;
}

TEST(TrkComparsionTest, KeyShorterThanThreeCharactersThrows) {
    EXPECT_THROW(TrkComparsion("AB", "TRK1"), std::out_of_range);
    EXPECT_THROW(TrkComparsion("TRK1", "T"), std::out_of_range);
}

TEST(TrkComparsionTest, MapOrdersByNumberAndMergesEquivalentKeys) {
    TrkMap map;
    map["TRK10"] = "Boom";
    map["TRK2"] = "Lav";
    map["TRK1"] = "Mix";
    EXPECT_EQ(Keys(map), "TRK1=Mix TRK2=Lav TRK10=Boom ");

    // Same number, other spelling: the key first inserted stays.
    EXPECT_FALSE(map.insert({"TRK01", "Other"}).second);
    EXPECT_FALSE(map.insert({"XYZ2", "Other"}).second);
    map["ABC10"] = "Plant";
    EXPECT_EQ(Keys(map), "TRK1=Mix TRK2=Lav TRK10=Plant ");

    // A key of letters matches the first key that the search meets.
    EXPECT_EQ(map.count("TRKa"), 1u);
    EXPECT_FALSE(map.insert({"TRKa", "Letter"}).second);
    EXPECT_EQ(map.size(), 3u);

    // Into an empty map it goes, and then stands for every key.
    TrkMap letters;
    letters["TRKa"] = "Letter";
    EXPECT_FALSE(letters.insert({"TRK5", "Five"}).second);
    EXPECT_EQ(Keys(letters), "TRKa=Letter ");
}

TEST(ConvertAlphaIndexToNumberTest, ReturnsNothingWhateverItIsGiven) {
    const std::map<std::string, std::string> keywords = {
        {"TRKa", "Boom"}, {"TRKz", "Lav"}, {"TRK1", "Mix"}, {"SCENE", "12"}};
    EXPECT_TRUE(ConvertAlphaIndexToNumber(keywords).empty());
    EXPECT_TRUE(ConvertAlphaIndexToNumber({}).empty());
}

}  // namespace
