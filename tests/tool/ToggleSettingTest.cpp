// `--toggle PATH=VALUE` as the command line reads it.
#include <gtest/gtest.h>

#include "ToggleSetting.h"
#include "boundary/OrloConstants.h"

namespace {

struct Case {
    std::string text;
    const char* problem;  ///< a part of the message, or null when accepted
    uint32_t value;
};

TEST(ToggleSettingTest, AcceptsTheFiveTogglesWithUnsignedValues) {
    const std::string origination = toggle_StartTimeCodeFromBEXTOriginationDate;
    const Case cases[] = {
        {std::string(toggle_MobIDFromiXML) + "=1", nullptr, 1},
        {std::string(toggle_StartTimeCodeFromFileCreationTime) + "=0", nullptr, 0},
        {origination + "=4294967295", nullptr, 4294967295u},
        {std::string(toggle_BigEndianSmpteIdInBEXTData) + "=007", nullptr, 7},
        {std::string(toggle_IgnoreHostSettingsForUnitTest) + "=2", nullptr, 2},
        // The path's constant name is not its path.
        {"/OrloReaderMovMediaContainer/StartTimeCodeFromBEXTOriginationDate=1", "is not a toggle of the plug-in", 0},
        {"MobIDFromiXML=1", "is not a toggle of the plug-in", 0},
        {"/OrloReaderMovMediaContainer/mobidfromixml=1", "is not a toggle of the plug-in", 0},
        {toggle_MobIDFromiXML, "is not PATH=VALUE", 0},
        {origination + "=", "is not an unsigned 32-bit number", 0},
        {origination + "=-1", "is not an unsigned 32-bit number", 0},
        {origination + "=+1", "is not an unsigned 32-bit number", 0},
        {origination + "=4294967296", "is not an unsigned 32-bit number", 0},
        {origination + "=99999999999", "is not an unsigned 32-bit number", 0},
        {origination + "=0x10", "is not an unsigned 32-bit number", 0},
        {origination + "= 1", "is not an unsigned 32-bit number", 0},
        {origination + "=on", "is not an unsigned 32-bit number", 0},
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

TEST(ToggleSettingTest, AnUnknownPathListsTheKnownOnes) {
    ToggleSetting toggle;
    const std::string problem = ToggleSetting::Parse("/Nope=1", toggle);
    for (const char* path : {toggle_MobIDFromiXML, toggle_StartTimeCodeFromFileCreationTime,
                             toggle_StartTimeCodeFromBEXTOriginationDate, toggle_BigEndianSmpteIdInBEXTData,
                             toggle_IgnoreHostSettingsForUnitTest})
        EXPECT_NE(problem.find(path), std::string::npos) << path;
}

}  // namespace
