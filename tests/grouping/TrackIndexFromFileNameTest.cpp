// The channel number of a numbered-suffix file name.
#include <gtest/gtest.h>

#include "grouping/TrackIndexFromFileName.h"

namespace {

using VTImportGrouping::TrackIndexFromFileName;

TEST(TrackIndexFromFileNameTest, AcceptsOneOrTwoCharactersThatReadAsOneToSixtyFour) {
    struct Case {
        const char* name;
        int index;
    };
    const Case cases[] = {
        {"Take7_1.wav", 1},   {"Take7_12.wav", 12}, {"Take7-3.wav", 3},  {"Take 4.wav", 4}, {"a_01.wav", 1},
        {"Take7_64.wav", 64}, {"Take7_1a.wav", 1},  {"Take7_+3.wav", 3}, {"Take_7.1", 7},
    };
    for (const Case& c : cases) {
        int index = -1;
        EXPECT_TRUE(TrackIndexFromFileName(c.name, index)) << c.name;
        EXPECT_EQ(index, c.index) << c.name;
    }
}

TEST(TrackIndexFromFileNameTest, RefusesOtherNamesAndLeavesTheIndex) {
    for (const char* name : {"", "Take7.wav", "Take7_1", "Take7_123.wav", "Take7_x.wav", "Take7_0.wav", "Take7_65.wav",
                             "Take7_.wav", "Take7_00.wav", "a_1.b-c", "Take_1.L.wav", "Take7_a1.wav"}) {
        int index = 42;
        EXPECT_FALSE(TrackIndexFromFileName(name, index)) << name;
        EXPECT_EQ(index, 42) << name;
    }
}

}  // namespace
