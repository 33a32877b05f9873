// Text forms of Mob IDs and UIDs, and the round trip through the 64 digits.
#include <gtest/gtest.h>

#include <cctype>
#include <string>
#include <vector>

#include "IdentityFixture.h"
#include "identity/GetMobIDFromString.h"
#include "identity/IDToString.h"

namespace {

using namespace ZEB;
using namespace ZEB::AAFUtils;

std::string Text(const ZEBString& s) { return reinterpret_cast<const char*>(s.GetUTF8String()); }

std::string WithoutSeparators(std::string text) {
    std::string digits;
    for (char c : text) {
        if (c != '-' && c != '{' && c != '}') digits += c;
    }
    return digits;
}

class IDToString : public IdentityFixture {};

TEST_F(IDToString, WritesTheFieldsInTheirOrder) {
    const _aafMobID_t id = {
        {0x06, 0x0A, 0x2B, 0x34, 0x01, 0x01, 0x01, 0x01, 0x01, 0x01, 0x0F, 0x00},      0x13, 0x00, 0x00, 0xB1,
        {0x3711D3CC, 0x62D0, 0x49D7, {0xB0, 0xAE, 0xC1, 0x18, 0x10, 0x1D, 0x1A, 0x16}}};
    EXPECT_EQ(Text(MobIDtoString(id)), "060A2B340101010101010F00-13-0000B1-{3711D3CC-62D0-49D7-B0AE-C118101D1A16}");
    EXPECT_EQ(Text(UIDtoString(id.material)), "{3711D3CC-62D0-49D7-B0AE-C118101D1A16}");
    EXPECT_EQ(Text(UIDtoString(_aafUID_t{})), "{00000000-0000-0000-0000-000000000000}");
}

TEST_F(IDToString, MobIDTextRoundTripsThroughItsDigits) {
    const std::vector<std::string> texts = {
        std::string(64, 'F'),
        // Every byte different, in either case: no digit pair lands in another's place.
        "000102030405060708090A0B0C0D0E0F101112131415161718191a1b1c1d1e1f",
    };
    for (const auto& text : texts) {
        _aafMobID_t id{};
        ASSERT_EQ(GetMobIDFromString(text.c_str(), &id), TOV_OK);
        std::string upper = text;
        for (char& c : upper) c = static_cast<char>(std::toupper(static_cast<unsigned char>(c)));
        EXPECT_EQ(WithoutSeparators(Text(MobIDtoString(id))), upper);
    }
}

}  // namespace
