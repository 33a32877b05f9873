#include "LinkCommand.h"

#include <cstdio>

#include "ClipDump.h"
#include "JsonText.h"
#include "ModuleRun.h"
#include "ResultText.h"
#include "boundary/OrloRegInfo.h"
#include "strings/ZEBString.h"
#include "tov/IMediaContainer3.h"

namespace {

using Json = nlohmann::ordered_json;

/// A string the caller owns, as UTF-8; null for none.
Json TakeText(ITOVString* string) {
    if (!string) return nullptr;
    ZEB::ZEBString owned(string, 1);
    return reinterpret_cast<const char*>(owned.GetUTF8String());
}

Json ExtensionTable(const IMediaContainer3& container) {
    Json rows = Json::array();
    for (unsigned int i = 0; i < container.GetFileExtensionCount(); ++i) {
        ITOVString* texts[3] = {};
        if (container.GetFileExtension(i, &texts[0], &texts[1], &texts[2]) < 0) break;
        rows.push_back({{"extension", TakeText(texts[0])},
                        {"shortName", TakeText(texts[1])},
                        {"description", TakeText(texts[2])}});
    }
    return rows;
}

/// The map's answers for track 0, as the host asks before it reads; null
/// where the map refused.
Json SampleMapAnswers(const ISampleMapping& map) {
    unsigned int channels = 0;
    unsigned long long samples = 0, frameBytes = 0, stride = 0, first = 0, last = 0, contiguous = 0;
    Json answers = {{"tracks", map.GetNumberOfTracks()}};
    auto answer = [&answers](const char* key, TOVRESULT result, auto value) {
        answers[key] = result >= 0 ? Json(value) : Json(nullptr);
    };
    TOVRESULT result = map.GetNumberOfChannels(0, &channels);
    answer("channels", result, channels);
    const TOVRESULT samplesResult = map.GetNumberOfSamples(0, &samples);
    answer("samples", samplesResult, samples);
    result = map.GetSampleSize(0, 0, &frameBytes);
    answer("bytesPerFrame", result, frameBytes);
    result = map.GetSampleStride(0, &stride);
    answer("stride", result, stride);
    result = map.GetSamplePosition(0, 0, &first);
    answer("firstPosition", result, first);
    result = samplesResult >= 0 && samples > 0 ? map.GetSamplePosition(0, samples - 1, &last) : TOV_E_OUTOFRANGE;
    answer("lastPosition", result, last);
    result = map.GetNumberOfContiguousBytes(0, 0, &contiguous);
    answer("contiguousBytes", result, contiguous);
    return answers;
}

void PrintText(const Json& report, const std::string& clipText) {
    auto yesNo = [](const Json& value) { return value == 1 || value == true ? "yes" : "no"; };
    std::printf("file: %s\nmodule: %s\n", ShownValue(report["file"]).c_str(), ShownValue(report["module"]).c_str());
    std::printf("supported: %s%s\n", yesNo(report["supported"]),
                report["redirected"] == true ? " (by the host's own container)" : "");
    std::printf("aaf: %s\ncapabilities: %s\nextensions:", yesNo(report["aafSupported"]),
                ShownValue(report["capabilities"]).c_str());
    for (const Json& row : report["extensions"]) std::printf(" %s", ShownValue(row["extension"]).c_str());
    const Json& clips = report["clips"];
    std::printf("\nclips: %s (result %s)\n", ShownValue(clips["count"]).c_str(), ShownValue(clips["result"]).c_str());
    const Json& map = report["sampleMap"];
    std::printf("sample map (result %s):", ShownValue(map["result"]).c_str());
    for (const char* key : {"tracks", "channels", "samples", "bytesPerFrame", "stride", "firstPosition", "lastPosition",
                            "contiguousBytes"})
        if (map.contains(key)) std::printf(" %s %s", key, ShownValue(map[key]).c_str());
    std::printf("\n");
    if (!clipText.empty()) std::printf("clip:\n%s", clipText.c_str());
}

}  // namespace

CLI::App* LinkCommand::Declare(CLI::App& app) {
    CLI::App* command = DeclareOn(app, "link", "link an audio file through the plug-in module as an editing host does");
    command->add_flag("--no-clock", m_NoClock, "leave out values that carry the clock (creation and change times)");
    command->add_option("--module", m_Module, "the plug-in module to load (default: the one beside orlo)");
    return command;
}

int LinkCommand::Run(const OrloOptions& options) {
    if (m_Module.empty()) m_Module = ModuleRun::DefaultModulePath();
    ModuleRun run(options.Verbosity(), m_Choices, m_Module);
    if (!run.Started()) return kExitFailed;
    Json report = {{"file", m_Path}, {"module", m_Module}};
    std::string clipText;
    bool linked = false;
    {
        TOVPtr<IMediaContainer3> container;
        const TOVRESULT made = run.Host().CreateComponent(OrloRegInfo::CompID_OrloReaderMovContainer, nullptr,
                                                          IID_IMediaContainer3, container.Out());
        if (SayRefused(made, "the module made no container") < 0) {
            run.Stop();
            return kExitFailed;
        }
        ZEB::ZEBString path(reinterpret_cast<const unsigned char*>(m_Path.c_str()));
        const TOVRESULT pathResult = container->SetFilePath(path.InArg());
        SayRefused(pathResult, m_Path + ": the container did not take the path");
        // Only a container without a factory throws here, which creation prevents.
        int32_t supported = 0;
        try {
            supported = container->IsContainerSupported();
        } catch (...) {
            SayRefused(TOV_E_UNEXPECTED, "the container failed its support test");
        }
        const auto* quickTime = run.Host().Registry().FindComponent(CompID_QuickTimeContainer);
        unsigned int capabilities = 0;
        const TOVRESULT capsResult = container->GetCapabilities(&capabilities);
        report["supported"] = supported != 0;
        report["redirected"] = quickTime && quickTime->created > 0;
        report["aafSupported"] = container->IsAAFSupported() != 0;
        report["capabilities"] = capsResult >= 0 ? Json(ResultText(static_cast<TOVRESULT>(capabilities))) : Json();
        report["extensions"] = ExtensionTable(*container);

        TOVPtr<IAAFClips> clips;
        const TOVRESULT clipsResult = container->GetAAFMasterClips(clips.OutT());
        Json clipsReport = {{"result", ResultJson(clipsResult)}, {"count", nullptr}, {"aaf", nullptr}};
        TOVRESULT dumped = clipsResult;
        if (clipsResult >= 0 && clips) {
            clipsReport["count"] = clips->Count();
            IAAFFile* file = nullptr;
            dumped = clips->GetMetadata(0, &file);
            if (dumped >= 0 && file) {
                dumped = DumpClip(file, m_Json, m_NoClock, clipText);
                file->Release();
                if (m_Json && dumped == TOV_OK) clipsReport["aaf"] = Json::parse(clipText, nullptr, false);
            }
        } else {
            SayRefused(clipsResult, m_Path + ": the container made no clip of it");
        }
        report["clips"] = clipsReport;

        TOVPtr<ISampleMapping> map;
        const TOVRESULT mapResult = container->GetSampleMapping(map.OutT());
        Json mapReport = {{"result", ResultJson(mapResult)}};
        bool mapHasMedia = false;
        if (mapResult >= 0 && map) {
            mapReport.update(SampleMapAnswers(*map));
            mapHasMedia = !mapReport["samples"].is_null();
            if (!mapHasMedia) SayRefused(ZEB_E_NOTREADY, m_Path + ": the sample map has no media");
        } else {
            SayRefused(mapResult, m_Path + ": the container made no sample map");
        }
        report["sampleMap"] = mapReport;
        linked = pathResult >= 0 && supported && dumped == TOV_OK && mapHasMedia;
    }
    report["console"] = run.Stop();
    if (m_Json)
        std::printf("%s\n", JsonDump(report, 2).c_str());
    else
        PrintText(report, clipText);
    return linked ? kExitOK : kExitFailed;
}
