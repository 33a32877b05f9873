// Readers of iXML element texts.
#include <gtest/gtest.h>

#include "ReaderTest.h"
#include "reader/SplitString.h"
#include "reader/ixml/IXMLTextParsers.h"

namespace {

using namespace Chunks::IXML;
using ZEB::ZEBString;

ZEBString Z(const char* text) { return ZEBString(reinterpret_cast<const unsigned char*>(text)); }

class IXMLTextParsers : public ReaderFixture {};

TEST_F(IXMLTextParsers, FrameRates) {
    const struct {
        const char* text;
        bool ok;
        int32_t numerator, denominator;
    } cases[] = {
        {"30000/1001", true, 30000, 1001},
        {"25/1", true, 25, 1},
        {"24000/1001fps", true, 24000, 1001},  // trailing text is ignored
        {"-25/1", true, -25, 1},
        {"25", false, 0, 0},
        {"25/", false, 0, 0},
        {"/1", false, 0, 0},
        {"25/1/1", false, 0, 0},
        {"x/1", false, 0, 0},
        {"", false, 0, 0},
        {"99999999999/1", false, 0, 0},
    };
    for (const auto& c : cases) {
        _aafRational_t rate{7, 7};
        EXPECT_EQ(FrameRateFromString(Z(c.text), rate), c.ok) << c.text;
        if (c.ok) {
            EXPECT_EQ(rate.numerator, c.numerator) << c.text;
            EXPECT_EQ(rate.denominator, c.denominator) << c.text;
        } else {
            EXPECT_EQ(rate.numerator, 7) << c.text << ": output left alone";
        }
    }
}

TEST_F(IXMLTextParsers, WordsAreExactCapitals) {
    const struct {
        const char* text;
        bool boolOk, boolValue, dropOk, dropValue;
    } cases[] = {
        {"TRUE", true, true, false, false},   {"FALSE", true, false, false, false},
        {"true", false, false, false, false}, {" TRUE", false, false, false, false},
        {"DF", false, false, true, true},     {"NDF", false, false, true, false},
        {"df", false, false, false, false},   {"", false, false, false, false},
    };
    for (const auto& c : cases) {
        bool value = false;
        EXPECT_EQ(BoolFromString(Z(c.text), value), c.boolOk) << c.text;
        if (c.boolOk) {
            EXPECT_EQ(value, c.boolValue) << c.text;
        }
        bool drop = false;
        EXPECT_EQ(DropFrameFromString(Z(c.text), drop), c.dropOk) << c.text;
        if (c.dropOk) {
            EXPECT_EQ(drop, c.dropValue) << c.text;
        }
    }
}

TEST_F(IXMLTextParsers, NumbersOfEachKind) {
    unsigned long long samples = 0;
    ASSERT_TRUE(SamplesFromString(Z("1"), Z("4294967295"), samples));
    EXPECT_EQ(samples, (1ull << 32) + 4294967295ull);
    for (const char* half : {"", "lots"}) {
        EXPECT_FALSE(SamplesFromString(Z(half), Z("5"), samples)) << half;
        EXPECT_FALSE(SamplesFromString(Z("1"), Z(half), samples)) << half;
    }
    uint16_t small = 9;
    EXPECT_TRUE(IntegerFromZEBString(Z("65535"), small));
    EXPECT_EQ(small, 65535);
    EXPECT_FALSE(IntegerFromZEBString(Z("65536"), small));
    EXPECT_FALSE(IntegerFromZEBString(Z(""), small));
    EXPECT_TRUE(IntegerFromZEBString(Z("12 channels"), small));
    EXPECT_EQ(small, 12);
    uint32_t large = 0;
    EXPECT_FALSE(IntegerFromZEBString(Z("lots"), large));
    EXPECT_TRUE(IntegerFromZEBString(Z(" 4294967295"), large)) << "a failed read does not stop the next";
    EXPECT_EQ(large, 4294967295u);
    double version = 0;
    EXPECT_TRUE(VersionFromString(Z("2.10"), version));
    EXPECT_DOUBLE_EQ(version, 2.1);
    EXPECT_FALSE(VersionFromString(Z("v2"), version));
    EXPECT_DOUBLE_EQ(version, 2.1);
}

TEST(SplitString, KeepsEmptyPieces) {
    EXPECT_EQ(HelperFunctions::SplitString("25/", '/'), (std::vector<std::string>{"25", ""}));
    EXPECT_EQ(HelperFunctions::SplitString("a", '/'), (std::vector<std::string>{"a"}));
    EXPECT_EQ(HelperFunctions::SplitString("/a//", '/'), (std::vector<std::string>{"", "a", "", ""}));
}

}  // namespace
