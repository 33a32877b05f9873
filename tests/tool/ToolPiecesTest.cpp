// The tool's own pieces: `--toggle PATH=VALUE` as the command line reads it,
// and a Mob ID's text, which reads back into the same 32 bytes.
#include <gtest/gtest.h>

#include <cstring>

#include "ToggleSetting.h"
#include "boundary/OrloConstants.h"
#include "identity/GetMobIDFromString.h"
#include "identity/IDText.h"

namespace {

struct Case {
    std::string text;
    const char* problem;  ///< a part of the message, or null when accepted
    uint32_t value;
};

TEST(ToggleSetting, AcceptsTheFiveTogglesWithUnsignedValues) {
    const std::string origination = toggle_StartTimeCodeFromBEXTOriginationDate;
    const Case cases[] = {
        {std::string(toggle_StartTimeCodeFromFileCreationTime) + "=0", nullptr, 0},
        {origination + "=4294967295", nullptr, 4294967295u},
        {std::string(toggle_BigEndianSmpteIdInBEXTData) + "=007", nullptr, 7},
        // The path's constant name is not its path.
        {"/OrloReaderMovMediaContainer/StartTimeCodeFromBEXTOriginationDate=1", "is not a toggle of the plug-in", 0},
        {"/OrloReaderMovMediaContainer/mobidfromixml=1", "is not a toggle of the plug-in", 0},
        {toggle_MobIDFromiXML, "is not PATH=VALUE", 0},
        {origination + "=", "is not an unsigned 32-bit number", 0},
        {origination + "=-1", "is not an unsigned 32-bit number", 0},
        {origination + "=+1", "is not an unsigned 32-bit number", 0},
        {origination + "=4294967296", "is not an unsigned 32-bit number", 0},
        {origination + "=0x10", "is not an unsigned 32-bit number", 0},
        {origination + "= 1", "is not an unsigned 32-bit number", 0},
    };
    for (const Case& c : cases) {
        ToggleSetting toggle;
        const std::string problem = ToggleSetting::Parse(c.text, toggle);
        if (c.problem == nullptr) {
            EXPECT_EQ(problem, "") << c.text;
            EXPECT_EQ(toggle.path, c.text.substr(0, c.text.rfind('='))) << c.text;
            EXPECT_EQ(toggle.value, c.value) << c.text;
        } else {
            EXPECT_NE(problem.find(c.problem), std::string::npos) << c.text << " gave: " << problem;
            EXPECT_TRUE(toggle.path.empty()) << c.text;
        }
    }
}

TEST(ToggleSetting, AnUnknownPathListsTheKnownOnes) {
    ToggleSetting toggle;
    const std::string problem = ToggleSetting::Parse("/Nope=1", toggle);
    for (const char* path :
         {toggle_MobIDFromiXML, toggle_StartTimeCodeFromFileCreationTime, toggle_StartTimeCodeFromBEXTOriginationDate,
          toggle_BigEndianSmpteIdInBEXTData, toggle_IgnoreHostSettingsForUnitTest})
        EXPECT_NE(problem.find(path), std::string::npos) << path;
}

_aafMobID_t Filled(unsigned char (*byte)(int)) {
    unsigned char bytes[sizeof(_aafMobID_t)];
    for (int i = 0; i < static_cast<int>(sizeof bytes); ++i) bytes[i] = byte(i);
    _aafMobID_t id;
    std::memcpy(&id, bytes, sizeof id);
    return id;
}

TEST(MobIDText, ReadsBackIntoTheSameBytes) {
    const _aafMobID_t ids[] = {
        Filled([](int) -> unsigned char { return 0xFF; }),
        Filled([](int i) -> unsigned char { return static_cast<unsigned char>(i * 37 + 11); }),
        // The material's fields differ in byte order from their text.
        Filled([](int i) -> unsigned char { return static_cast<unsigned char>(i < 16 ? 0 : i); }),
    };
    for (const _aafMobID_t& id : ids) {
        const std::string text = ZEB::MobIDDigits(id, ZEB::HexCase::Upper);
        ASSERT_EQ(text.size(), 64u);
        EXPECT_EQ(text.find_first_not_of("0123456789ABCDEF"), std::string::npos) << text;
        _aafMobID_t back;
        std::memset(&back, 0x5A, sizeof back);
        ASSERT_EQ(ZEB::GetMobIDFromString(text.c_str(), &back), TOV_OK);
        EXPECT_EQ(std::memcmp(&back, &id, sizeof id), 0) << text;
    }
}

}  // namespace
