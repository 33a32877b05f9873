// Mob IDs read from short or broken texts: what they leave behind. Where each
// digit goes is proven by the round trip in IDToStringTest.
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

TEST(GetMobIDFromString, ShortOrBrokenTextLeavesStaleBytesAndOnlyANullRecordFails) {
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
    EXPECT_EQ(GetMobIDFromString("00", nullptr), TOV_E_INVALIDARG);
}

}  // namespace
