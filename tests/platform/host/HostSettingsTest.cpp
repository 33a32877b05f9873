// The host's settings: one store per host, seen by every settings object of it.
#include <gtest/gtest.h>

#include "TestHost.h"
#include "tov/IHostSettings.h"
#include "tov/host/HostSettings.h"

namespace {

constexpr _tovUID kOtherSetting = {0x01020304, 0x0506, 0x0708, {9, 10, 11, 12, 13, 14, 15, 16}};
const _tovUID& kGrouping = ZEBHostSetting_AutodetectMonophonicBroadcastWaveGroups;

TOVPtr<IHostSettings> NewSettings(TOVHost* host) {
    TOVPtr<IHostSettings> settings;
    EXPECT_EQ(host->CreateComponent(CompID_HostSettings, nullptr, IID_IHostSettings, settings.Out()), TOV_OK);
    return settings;
}

// Named after its subject; the component itself is ::HostSettings.
class HostSettings : public ::testing::Test {
protected:
    uint32_t ValueOf(const _tovUID& setting) {
        uint32_t value = 0xDEAD;
        EXPECT_EQ(settings->GetSetting(setting, 16, &value), TOV_OK);
        return value;
    }

    TestHost host;
    TOVPtr<IHostSettings> settings = NewSettings(host.Get());
};

TEST_F(HostSettings, AreSharedByTheSettingsObjectsOfOneHostOnly) {
    ASSERT_EQ(settings->SetSetting(kOtherSetting, 32, 5), TOV_OK);
    ASSERT_EQ(NewSettings(host.Get())->SetSetting(kGrouping, 32, 1), TOV_OK);
    EXPECT_EQ(ValueOf(kGrouping), 1u);
    EXPECT_EQ(ValueOf(kOtherSetting), 5u);

    TestHost otherHost;
    uint32_t value = 0xDEAD;
    EXPECT_EQ(NewSettings(otherHost.Get())->GetSetting(kGrouping, 16, &value), ZEB_E_NOTFOUND);
    EXPECT_EQ(value, 0xDEADu) << "an unset setting leaves the value";
}

TEST_F(HostSettings, AnySizeUpTo32BitsReadsAndWritesTheWholeValue) {
    const struct {
        uint32_t size;
        TOVRESULT expected;
    } cases[] = {{0, TOV_E_INVALIDARG}, {1, TOV_OK}, {32, TOV_OK}, {33, TOV_E_INVALIDARG}};
    for (const auto& c : cases) {
        SCOPED_TRACE(c.size);
        EXPECT_EQ(settings->SetSetting(kGrouping, c.size, 0x12345678u + c.size), c.expected);
        uint32_t value = 0;
        EXPECT_EQ(settings->GetSetting(kGrouping, c.size, &value), c.expected);
        if (c.expected == TOV_OK) {
            EXPECT_EQ(value, 0x12345678u + c.size);
        }
    }
    EXPECT_EQ(settings->GetSetting(kGrouping, 16, nullptr), TOV_E_INVALIDARG);
}

TEST_F(HostSettings, NeedAHostWithAStore) {
    TOVPtr<IHostSettings> made;
    EXPECT_EQ(::HostSettings::TOVCreate(nullptr, nullptr, IID_IHostSettings, made.Out()), ZEB_E_NOTREADY);
    EXPECT_FALSE(made);
}

}  // namespace
