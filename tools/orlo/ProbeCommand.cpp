#include "ProbeCommand.h"

#include <cstdio>
#include <memory>
#include <nlohmann/json.hpp>

#include "JsonText.h"
#include "MovieReport.h"
#include "OrloSession.h"
#include "ProbeText.h"
#include "ResultText.h"
#include "ToggleSetting.h"
#include "boundary/AudioImportSettings.h"
#include "boundary/DynamicToggles.h"
#include "boundary/NewMovieFromFilePath.h"
#include "boundary/PluginStartup.h"
#include "reader/OrloStream.h"
#include "tov/IHostSettings.h"
#include "tov/sdk/TOVFailureStyle.h"

namespace {

using Json = nlohmann::ordered_json;

// Says on stderr what was not done, and passes the result on.
TOVRESULT Refused(TOVRESULT result, const std::string& what) {
    if (result < 0) std::fprintf(stderr, "orlo: %s (%s)\n", what.c_str(), ResultText(result).c_str());
    return result;
}

// The toggles through the plug-in's own setter, the setting through the
// host's settings object, as a user's choices in the host would stand.
// The texts were checked when the command line was read.
TOVRESULT ApplyChoices(TOVHost& host, const std::vector<std::string>& toggleTexts, bool noAutodetectGroups) {
    TOVPtr<ITOVComponentFactory> factory;
    factory.Assign(&host);
    for (const std::string& text : toggleTexts) {
        ToggleSetting toggle;
        ToggleSetting::Parse(text, toggle);
        const TOVRESULT result = ZEB::Impl::SetDynamicToggleValue(factory, toggle.path, toggle.value);
        if (Refused(result, "the toggle " + toggle.path + " was not set") < 0) return result;
    }
    // Without the option the host has no value for the setting, so the
    // plug-in's default stands.
    if (!noAutodetectGroups) return TOV_OK;
    return Refused(TOVGuarded([&] {
                       TOVPtr<IHostSettings> settings;
                       TOVCheck(host.CreateComponent(CompID_HostSettings, nullptr, IID_IHostSettings, settings.Out()));
                       return settings->SetSetting(ZEBHostSetting_AutodetectMonophonicBroadcastWaveGroups, 32, 0);
                   }),
                   "the host's grouping setting was not stored");
}

// The grouping decision the plug-in takes from the host before it reads the file.
bool GroupingAllowed(TOVHost& host) {
    bool allowed = true;
    TOVPtr<IHostSettings> settings;
    ZEB::Impl::GetAudioImportSettings(&host, settings, allowed);
    return allowed;
}

TOVRESULT MakeMovie(TOVHost& host, const std::string& path, Json& report) {
    OrloReader::Movie* movie = nullptr;
    const TOVRESULT result = ZEB::Impl::NewMovieFromFilePath(
        ZEB::ZEBString(reinterpret_cast<const unsigned char*>(path.c_str())), &movie, &host);
    const std::unique_ptr<OrloReader::Movie> owned(movie);
    report["result"] = ResultJson(result);
    if (result == TOV_OK && owned) report.update(MovieReport(*owned));
    return result;
}

}  // namespace

CLI::App* ProbeCommand::Declare(CLI::App& app) {
    CLI::App* command =
        app.add_subcommand("probe", "make the clip of an audio file as the host's container does, and show it");
    command->add_option("FILE", m_Path, "a WAV, Broadcast Wave, RF64, AIFF or AIFF-C file")->required();
    command->add_flag("--json", m_Json, "one JSON object instead of text");
    command->add_option("--toggle", m_ToggleTexts, "set one of the plug-in's toggles first (repeatable)")
        ->type_name("PATH=VALUE")
        ->check([](const std::string& text) {
            ToggleSetting toggle;
            return ToggleSetting::Parse(text, toggle);
        });
    command->add_flag("--no-autodetect-groups", m_NoAutodetectGroups,
                      "tell the plug-in, as the host's setting, not to group mono files of one recording");
    return command;
}

int ProbeCommand::Run(const OrloOptions& options) {
    OrloSession session(options.Verbosity(), true);
    if (!session.Started()) return kExitFailed;
    TOVHost& host = session.Host();
    const size_t before = session.ConsoleLines().size();

    // "result" is filled in below; it stands second so that it is seen first.
    Json report = {{"file", m_Path}, {"result", nullptr}};
    TOVRESULT result = TOV_OK;
    {
        PluginStartup plugin(host.AsUnknown());
        if (Refused(plugin.Result(), "the plug-in did not start") < 0) return kExitFailed;
        if (ApplyChoices(host, m_ToggleTexts, m_NoAutodetectGroups) < 0) return kExitFailed;
        report["groupingAllowed"] = GroupingAllowed(host);
        result = MakeMovie(host, m_Path, report);
    }
    // The lines from the plug-in's start-up to the Movie's end; the utility
    // library's own start-up lines come before.
    const auto& lines = session.ConsoleLines();
    const Json console(std::vector<std::string>(lines.begin() + static_cast<long>(before), lines.end()));

    if (result != TOV_OK) {
        // The plug-in gives only a code; the chunk stream's error, when it
        // has one, says what is wrong with the file.
        const Orlo::OrloStream stream(m_Path.c_str(), Orlo::kAllChunks);
        const char* error = stream.GetError();
        report["reason"] = error ? Json(error) : Json(nullptr);
        std::fprintf(stderr, "orlo: %s: the plug-in made no clip of it (%s)%s%s\n", m_Path.c_str(),
                     ResultText(result).c_str(), error ? ": " : "", error ? error : "");
    }
    report["console"] = console;
    if (m_Json) {
        std::printf("%s\n", JsonDump(report, 2).c_str());
    } else if (result == TOV_OK) {
        PrintProbeText(report);
    }
    return result == TOV_OK ? kExitOK : kExitFailed;
}
