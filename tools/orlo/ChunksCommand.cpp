#include "ChunksCommand.h"

#include <cstdio>
#include <nlohmann/json.hpp>
#include <stdexcept>

#include "IxmlReport.h"
#include "JsonText.h"
#include "OrloSession.h"
#include "identity/IDText.h"
#include "reader/BEXTChunk.h"
#include "reader/OrloStream.h"
#include "reader/UMIDChunk.h"
#include "reader/ixml/IXMLChunk.h"

namespace {

using Json = nlohmann::ordered_json;
using Orlo::OrloStream;

// The fixed-size text fields of bext are filled with zero bytes.
std::string UpToZero(const std::string& text) { return text.substr(0, text.find('\0')); }

// An accessor's value, or null when the stream has no chunk to answer from.
template <typename Get>
Json ValueOr(Get get) {
    try {
        return Json(get());
    } catch (const std::exception&) {
        return nullptr;
    }
}

Json Chunks(const OrloStream& stream) {
    Json ids = Json::array();
    for (const Orlo::ChunkTableRow& row : Orlo::kChunkTable)
        if (stream.HasChunk(row.bit)) ids.push_back(row.id);
    return ids;
}

Json Bext(const Chunks::BEXT::BEXTChunk& bext) {
    Json out = {{"description", UpToZero(bext.GetDescription())},
                {"originator", UpToZero(bext.GetOriginator())},
                {"originatorReference", UpToZero(bext.GetOriginatorReference())},
                {"originationDate", UpToZero(bext.GetOriginationDate())},
                {"originationTime", UpToZero(bext.GetOriginationTime())},
                {"timeReference", bext.GetTimeReference()},
                {"version", bext.GetVersion()},
                {"umid", ZEB::HexText(bext.GetUMID(), 64, ZEB::HexCase::Lower)},
                {"keywords", Json(bext.GetConstParsedDescriptionField())},
                {"codingHistory", UpToZero(bext.GetCodingHistory())}};
    if (bext.GetVersion() == 2) {
        const auto& loudness = bext.GetLoudness();
        out["loudness"] = {{"loudnessValue", loudness.loudnessValue},
                           {"loudnessRange", loudness.loudnessRange},
                           {"maxTruePeakLevel", loudness.maxTruePeakLevel},
                           {"maxMomentaryLoudness", loudness.maxMomentaryLoudness},
                           {"maxShortTermLoudness", loudness.maxShortTermLoudness}};
    }
    return out;
}

Json Report(const std::string& path, const OrloStream& stream, ITOVComponentFactory* factory) {
    const char* error = stream.GetError();
    Json out = {{"file", path},
                {"error", error ? Json(error) : Json(nullptr)},
                {"wrongEndian", stream.IsFileWrongEndian()},
                {"rf64", stream.IsRF64()},
                {"chunks", Chunks(stream)},
                {"channels", ValueOr([&] { return stream.GetChannelCount(); })},
                {"sampleRate", ValueOr([&] { return stream.GetSampleRate(); })},
                {"bitsPerSample", ValueOr([&] { return stream.GetBitsPerSample(); })},
                {"floatingPoint", ValueOr([&] { return stream.GetIsDataFloatingPoint(); })},
                {"sampleCount", ValueOr([&] { return stream.GetSampleCount(); })},
                {"sampleSize", ValueOr([&] { return stream.GetSampleSize(); })},
                {"startPosition", ValueOr([&] { return stream.GetStartPosition(); })},
                {"dataWrongEndian", ValueOr([&] { return stream.GetIsDataWrongEndian(); })}};
    if (stream.HasChunk(OrloStream::BEXT_CHUNK)) out["bext"] = Bext(*stream.GetChunk<Chunks::BEXT::BEXTChunk>());
    if (stream.HasChunk(OrloStream::IXML_CHUNK))
        out["ixml"] = IxmlReport(stream.GetChunk<Chunks::IXML::IXMLChunk>()->GetRawXml(), factory);
    if (stream.HasChunk(OrloStream::UMID_CHUNK)) {
        const auto umid = stream.GetChunk<Chunks::UMID::UMIDChunk>();
        out["umid"] = {{"hex", ZEB::HexText(umid->GetUMID(), 24, ZEB::HexCase::Lower)}, {"valid", umid->IsValid()}};
    }
    return out;
}

// "key: value" lines, nested objects indented.
void PrintText(const Json& object, int depth) {
    for (const auto& [key, value] : object.items()) {
        const std::string margin(depth * 2, ' ');
        if (value.is_object()) {
            std::printf("%s%s:\n", margin.c_str(), key.c_str());
            PrintText(value, depth + 1);
            continue;
        }
        std::printf("%s%s: %s\n", margin.c_str(), key.c_str(), ShownValue(value).c_str());
    }
}

}  // namespace

CLI::App* ChunksCommand::Declare(CLI::App& app) {
    CLI::App* command = app.add_subcommand("chunks", "show what the chunk stream makes of an audio file, and why");
    command->add_option("FILE", m_Path, "a WAV, Broadcast Wave, RF64, AIFF or AIFF-C file")->required();
    command->add_flag("--json", m_Json, "one JSON object instead of text");
    return command;
}

int ChunksCommand::Run(const OrloOptions& options) {
    OrloSession session(options.Verbosity(), false);
    if (!session.Started()) return kExitFailed;
    const OrloStream stream(m_Path.c_str(), Orlo::kAllChunks);
    const Json report = Report(m_Path, stream, &session.Host());
    if (m_Json) {
        std::printf("%s\n", JsonDump(report, 2).c_str());
    } else {
        PrintText(report, 0);
    }
    return stream.GetError() ? kExitFailed : kExitOK;
}
