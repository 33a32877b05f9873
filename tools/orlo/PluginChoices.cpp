#include "PluginChoices.h"

#include "ResultText.h"
#include "ToggleSetting.h"
#include "boundary/DynamicToggles.h"
#include "tov/IHostSettings.h"
#include "tov/sdk/TOVFailureStyle.h"

void PluginChoices::Declare(CLI::App& command) {
    command.add_option("--toggle", m_ToggleTexts, "set one of the plug-in's toggles first (repeatable)")
        ->type_name("PATH=VALUE")
        ->check([](const std::string& text) {
            ToggleSetting toggle;
            return ToggleSetting::Parse(text, toggle);
        });
    command.add_flag("--no-autodetect-groups", m_NoAutodetectGroups,
                     "tell the plug-in, as the host's setting, not to group mono files of one recording");
}

// The toggles through the plug-in's own setter, the setting through the
// host's settings object. The texts were checked when the command line was read.
TOVRESULT PluginChoices::Apply(TOVHost& host) const {
    TOVPtr<ITOVComponentFactory> factory;
    factory.Assign(&host);
    for (const std::string& text : m_ToggleTexts) {
        ToggleSetting toggle;
        ToggleSetting::Parse(text, toggle);
        const TOVRESULT result = ZEB::Impl::SetDynamicToggleValue(factory, toggle.path, toggle.value);
        if (SayRefused(result, "the toggle " + toggle.path + " was not set") < 0) return result;
    }
    // Without the option the host has no value for the setting, so the
    // plug-in's default stands.
    if (!m_NoAutodetectGroups) return TOV_OK;
    return SayRefused(
        TOVGuarded([&] {
            TOVPtr<IHostSettings> settings;
            TOVCheck(host.CreateComponent(CompID_HostSettings, nullptr, IID_IHostSettings, settings.Out()));
            return settings->SetSetting(ZEBHostSetting_AutodetectMonophonicBroadcastWaveGroups, 32, 0);
        }),
        "the host's grouping setting was not stored");
}
