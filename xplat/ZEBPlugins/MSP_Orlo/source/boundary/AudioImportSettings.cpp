#include "boundary/AudioImportSettings.h"

#include "boundary/DynamicToggles.h"
#include "boundary/OrloConstants.h"
#include "tov/sdk/TOVFailureStyle.h"

namespace ZEB {
namespace Impl {

namespace {

/// The size argument every caller passes; the host reads the whole value.
constexpr uint32_t kSettingSize = 16;

}  // namespace

TOVRESULT GetAudioImportSettings(ITOVComponentFactory* factory, TOVPtr<IHostSettings>& settings, bool& autodetect) {
    return TOVGuarded([&] {
        unsigned int ignoreHost = 0;
        // A toggle that cannot be read counts as off.
        RetrieveDynamicToggleValue(factory, toggle_IgnoreHostSettingsForUnitTest, &ignoreHost);
        if (ignoreHost == 0) {
            settings.Reset();
            // No settings object means the caller's default stands.
            if (factory) factory->CreateComponent(CompID_HostSettings, nullptr, IID_IHostSettings, settings.Out());
        }
        if (!settings) return TOV_OK;
        uint32_t value = 0;
        if (settings->GetSetting(ZEBHostSetting_AutodetectMonophonicBroadcastWaveGroups, kSettingSize, &value) ==
            TOV_OK)
            autodetect = value != 0;
        return TOV_OK;
    });
}

}  // namespace Impl
}  // namespace ZEB
