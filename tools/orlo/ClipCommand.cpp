#include "ClipCommand.h"

#include <cstdio>
#include <nlohmann/json.hpp>

#include "ClipDump.h"
#include "JsonText.h"
#include "NoClipReason.h"
#include "PluginRun.h"
#include "ResultText.h"
#include "aafbuilder/NewAAFFromMovie.h"

namespace {

using Json = nlohmann::ordered_json;

// The loader's own failures, which mean that no AAF library could be used
// rather than that this file's clip could not be built.
bool IsLoaderFailure(TOVRESULT result) {
    return result == AAFRESULT_DLL_LOAD_FAILED || result == AAFRESULT_DLL_SYMBOL_NOT_FOUND;
}

}  // namespace

CLI::App* ClipCommand::Declare(CLI::App& app) {
    CLI::App* command =
        DeclareOn(app, "clip", "make the AAF clip of an audio file as the host's container does, and show it");
    command->add_flag("--no-clock", m_NoClock, "leave out values that carry the clock (creation and change times)");
    return command;
}

int ClipCommand::Run(const OrloOptions& options) {
    PluginRun run(options.Verbosity(), m_Choices);
    if (!run.Started()) return kExitFailed;

    Json report = {{"file", m_Path}, {"result", nullptr}, {"stage", nullptr}, {"aaf", nullptr}};
    std::string dump;
    TOVRESULT result = TOV_OK;
    if (const auto movie = run.NewMovie(m_Path, result)) {
        IAAFFile* file = nullptr;
        result = ZEB::Impl::NewAAFFromMovie(
            movie.get(), ZEB::ZEBString(reinterpret_cast<const unsigned char*>(m_Path.c_str())), &file, &run.Host());
        if (result == TOV_OK) {
            result = DumpClip(file, m_Json, m_NoClock, dump);
            file->Release();
        } else if (IsLoaderFailure(result)) {
            SayRefused(result, "no AAF library could be loaded (libcom-api.so)");
        } else {
            SayRefused(result, m_Path + ": the plug-in made no AAF clip of it");
        }
        report["stage"] = result == TOV_OK ? Json(nullptr) : Json("aaf");
    } else {
        report["stage"] = "movie";
        SayNoClip(m_Path, result);
    }
    report["result"] = ResultJson(result);
    report["console"] = run.Stop();

    if (m_Json) {
        // The dump writes its texts as UTF-8 from wide strings, so it parses.
        if (result == TOV_OK) report["aaf"] = Json::parse(dump, nullptr, false);
        std::printf("%s\n", JsonDump(report, 2).c_str());
    } else if (result == TOV_OK) {
        std::fputs(dump.c_str(), stdout);
    }
    return result == TOV_OK ? kExitOK : kExitFailed;
}
