// Mob IDs read from 64 hexadecimal digits: where each digit goes, and what a
// short or broken text leaves behind.
#include <gtest/gtest.h>

#include <algorithm>
#include <cstring>
#include <string>
#include <vector>

#include "identity/GetMobIDFromString.h"

namespace {

using ZEB::GetMobIDFromString;

_aafMobID_t Filled(unsigned char byte) {
    _aafMobID_t id;
    std::memset(&id, byte, sizeof id);
    return id;
}

TEST(GetMobIDFromString, PutsEachDigitPairInItsField) {
    const char* text = "000102030405060708090A0B0C0D0E0F101112131415161718191a1b1c1d1e1f";
    _aafMobID_t id = Filled(0xEE);
    ASSERT_EQ(GetMobIDFromString(text, &id), TOV_OK);
    for (int i = 0; i < 12; ++i) EXPECT_EQ(id.SMPTELabel[i], i) << "label byte " << i;
    EXPECT_EQ(id.length, 0x0C);
    EXPECT_EQ(id.instanceHigh, 0x0D);
    EXPECT_EQ(id.instanceMid, 0x0E);
    EXPECT_EQ(id.instanceLow, 0x0F);
    EXPECT_EQ(id.material.Data1, 0x10111213u);
    EXPECT_EQ(id.material.Data2, 0x1415);
    EXPECT_EQ(id.material.Data3, 0x1617);
    for (int i = 0; i < 8; ++i) EXPECT_EQ(id.material.Data4[i], 0x18 + i) << "Data4 byte " << i;
}

TEST(GetMobIDFromString, ShortOrBrokenTextLeavesStaleBytesAndStillSucceeds) {
    struct Case {
        const char* name;
        std::string text;
        std::vector<int> written;  // byte offsets in the record that the text sets
    };
    const std::vector<Case> cases = {
        {"empty", "", {}},
        {"two label bytes", "0102", {0, 1}},
        {"one digit gives the first byte a value", "7", {0}},
        {"not hexadecimal", std::string(64, 'z'), {}},
        {"a bad pair in the label skips only that byte", "01zz03", {0, 2}},
        {"the instance stops at its first bad pair",
         std::string(24, '0') + "0102zz04",
         {0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13}},
        {"up to the material", std::string(32, '0'), {0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 15}},
    };
    for (const auto& c : cases) {
        _aafMobID_t id = Filled(0xEE);
        EXPECT_EQ(GetMobIDFromString(c.text.c_str(), &id), TOV_OK) << c.name;
        const auto* bytes = reinterpret_cast<const unsigned char*>(&id);
        for (int i = 0; i < 32; ++i) {
            const bool written = std::find(c.written.begin(), c.written.end(), i) != c.written.end();
            if (written) {
                EXPECT_NE(bytes[i], 0xEE) << c.name << ": byte " << i;
            } else {
                EXPECT_EQ(bytes[i], 0xEE) << c.name << ": byte " << i << " should be stale";
            }
        }
    }
}

TEST(GetMobIDFromString, RefusesANullRecord) { EXPECT_EQ(GetMobIDFromString("00", nullptr), TOV_E_INVALIDARG); }

}  // namespace
