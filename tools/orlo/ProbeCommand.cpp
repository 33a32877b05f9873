#include "ProbeCommand.h"

#include <cstdio>
#include <nlohmann/json.hpp>

#include "JsonText.h"
#include "MovieReport.h"
#include "NoClipReason.h"
#include "PluginRun.h"
#include "ProbeText.h"
#include "ResultText.h"
#include "boundary/AudioImportSettings.h"
#include "tov/IHostSettings.h"

namespace {

using Json = nlohmann::ordered_json;

// The grouping decision the plug-in takes from the host before it reads the file.
bool GroupingAllowed(TOVHost& host) {
    bool allowed = true;
    TOVPtr<IHostSettings> settings;
    ZEB::Impl::GetAudioImportSettings(&host, settings, allowed);
    return allowed;
}

}  // namespace

CLI::App* ProbeCommand::Declare(CLI::App& app) {
    return DeclareOn(app, "probe", "make the clip of an audio file as the host's container does, and show it");
}

int ProbeCommand::Run(const OrloOptions& options) {
    PluginRun run(options.Verbosity(), m_Choices);
    if (!run.Started()) return kExitFailed;

    // "result" is filled in below; it stands second so that it is seen first.
    Json report = {{"file", m_Path}, {"result", nullptr}};
    report["groupingAllowed"] = GroupingAllowed(run.Host());
    TOVRESULT result = TOV_OK;
    if (const auto movie = run.NewMovie(m_Path, result)) report.update(MovieReport(*movie));
    report["result"] = ResultJson(result);
    const Json console = run.Stop();

    if (result != TOV_OK) report["reason"] = SayNoClip(m_Path, result);
    report["console"] = console;
    if (m_Json) {
        std::printf("%s\n", JsonDump(report, 2).c_str());
    } else if (result == TOV_OK) {
        PrintProbeText(report);
    }
    return result == TOV_OK ? kExitOK : kExitFailed;
}
