// Reading the grouping setting: from the host, past a failing settings
// object, and not at all while the toggle says to ignore the host.
#include <gtest/gtest.h>

#include "BoundaryMocks.h"
#include "TestHost.h"
#include "boundary/AudioImportSettings.h"
#include "boundary/DynamicToggles.h"
#include "boundary/OrloConstants.h"

namespace {

using ::testing::_;
using ::testing::DoAll;
using ::testing::NiceMock;
using ::testing::Return;
using ::testing::SetArgPointee;
using ZEB::Impl::GetAudioImportSettings;

const _tovUID& kGrouping = ZEBHostSetting_AutodetectMonophonicBroadcastWaveGroups;

// A host with its factory and a settings object of its own.
struct HostWithSettings {
    HostWithSettings() {
        factory.Assign(host.Get());
        EXPECT_EQ(host->CreateComponent(CompID_HostSettings, nullptr, IID_IHostSettings, hostSettings.Out()), TOV_OK);
    }

    void IgnoreTheHost() {
        ZEB::Impl::RegisterDynamicToggles(factory);
        ASSERT_EQ(ZEB::Impl::SetDynamicToggleValue(factory, toggle_IgnoreHostSettingsForUnitTest, 1), TOV_OK);
    }

    TestHost host;
    TOVPtr<ITOVComponentFactory> factory;
    TOVPtr<IHostSettings> hostSettings;
};

struct HostValueCase {
    const char* name;
    bool hasValue;
    uint32_t value;
    bool before, after;
};

TEST(AudioImportSettings, HostsDecideWhenTheyHaveAValue) {
    const HostValueCase cases[] = {
        // Unset keeps the caller's value; the stand-ins below show it kept true.
        {"unset keeps false", false, 0, false, false},
        {"zero turns grouping off", true, 0, true, false},
        {"any other value turns it on", true, 2, false, true},
    };
    for (const HostValueCase& c : cases) {
        SCOPED_TRACE(c.name);
        HostWithSettings fresh;
        if (c.hasValue) {
            ASSERT_EQ(fresh.hostSettings->SetSetting(kGrouping, 32, c.value), TOV_OK);
        }
        TOVPtr<IHostSettings> settings;
        bool autodetect = c.before;
        EXPECT_EQ(GetAudioImportSettings(fresh.factory.Get(), settings, autodetect), TOV_OK);
        EXPECT_EQ(autodetect, c.after);
        EXPECT_TRUE(settings);  // stays filled for the caller
    }
}

enum class Kept { CallersOwn, HostsObject, Nothing };

struct CallerSettingsCase {
    const char* name;
    bool ignoreHost, withFactory, callerGivesOwn;
    bool ownAsked;  ///< the caller's object answers 0 when asked
    bool after;     ///< from true, with the host's setting at 0
    Kept kept;
};

TEST(AudioImportSettings, CallersAreAskedOnlyWhileTheHostIsIgnored) {
    const CallerSettingsCase cases[] = {
        {"ignoring the host makes none", true, true, false, false, true, Kept::Nothing},
        {"ignoring the host asks the caller's", true, true, true, true, false, Kept::CallersOwn},
        {"otherwise the host's replace them", false, true, true, false, false, Kept::HostsObject},
        {"without a factory they are dropped", false, false, true, false, true, Kept::Nothing},
    };
    for (const CallerSettingsCase& c : cases) {
        SCOPED_TRACE(c.name);
        HostWithSettings fresh;
        ASSERT_EQ(fresh.hostSettings->SetSetting(kGrouping, 32, 0), TOV_OK);
        if (c.ignoreHost) fresh.IgnoreTheHost();
        NiceMock<MockSettings> own;
        ON_CALL(own, GetSetting(_, _, _)).WillByDefault(DoAll(SetArgPointee<2>(0u), Return(TOV_OK)));
        EXPECT_CALL(own, GetSetting(kGrouping, 16u, _)).Times(c.ownAsked ? 1 : 0);
        TOVPtr<IHostSettings> settings;
        if (c.callerGivesOwn) settings.Assign(&own);
        bool autodetect = true;
        EXPECT_EQ(GetAudioImportSettings(c.withFactory ? fresh.factory.Get() : nullptr, settings, autodetect), TOV_OK);
        EXPECT_EQ(autodetect, c.after);
        EXPECT_EQ(settings.Get() == &own, c.kept == Kept::CallersOwn);
        EXPECT_EQ(settings.Get() != nullptr, c.kept != Kept::Nothing);
    }
}

TEST(AudioImportSettings, AnAnswerOtherThanSuccessKeepsTheDefault) {
    // A positive result is not success either.
    for (const TOVRESULT result : {TOV_E_FAIL, static_cast<TOVRESULT>(1)}) {
        SCOPED_TRACE(result);
        NiceMock<MockFactory> factory;
        NiceMock<MockSettings> hostSettings;
        // No toggle manager: the toggle reads as off, so the settings are made.
        ON_CALL(factory, CreateComponent(TOVCompID_FTFManager, _, _, _)).WillByDefault(FailCreation(ZEB_E_NOTFOUND));
        ON_CALL(factory, CreateComponent(CompID_HostSettings, nullptr, IID_IHostSettings, _))
            .WillByDefault(HandOut<IHostSettings>(&hostSettings));
        EXPECT_CALL(hostSettings, GetSetting(kGrouping, 16u, _)).WillOnce(DoAll(SetArgPointee<2>(0u), Return(result)));
        TOVPtr<IHostSettings> settings;
        bool autodetect = true;
        EXPECT_EQ(GetAudioImportSettings(&factory, settings, autodetect), TOV_OK);
        EXPECT_TRUE(autodetect);
    }
}

TEST(AudioImportSettings, NoSettingsObjectOrAThrowingOneLeavesTheDefault) {
    NiceMock<MockFactory> factory;
    NiceMock<MockSettings> throwing;
    ON_CALL(factory, CreateComponent(_, _, _, _)).WillByDefault(FailCreation(ZEB_E_NOTFOUND));
    TOVPtr<IHostSettings> settings;
    bool autodetect = false;
    EXPECT_EQ(GetAudioImportSettings(&factory, settings, autodetect), TOV_OK);
    EXPECT_FALSE(autodetect);
    EXPECT_FALSE(settings);

    ON_CALL(factory, CreateComponent(CompID_HostSettings, _, _, _)).WillByDefault(HandOut<IHostSettings>(&throwing));
    ON_CALL(throwing, GetSetting(_, _, _)).WillByDefault(::testing::Throw(std::runtime_error("gone")));
    autodetect = true;
    EXPECT_EQ(GetAudioImportSettings(&factory, settings, autodetect), TOV_E_UNEXPECTED);
    EXPECT_TRUE(autodetect);
}

}  // namespace
