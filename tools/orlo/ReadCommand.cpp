#include "ReadCommand.h"

#include <fcntl.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>
#include <cstring>
#include <memory>
#include <nlohmann/json.hpp>

#include "JsonText.h"
#include "ModuleRun.h"
#include "PluginChoices.h"
#include "ProgressBar.h"
#include "ResultText.h"
#include "WavOutput.h"
#include "boundary/OrloRegInfo.h"
#include "identity/IDText.h"
#include "reader/ChunkTable.h"
#include "reader/OrloStream.h"
#include "strings/ZEBString.h"
#include "tov/IMediaContainer3.h"
#include "tov/host/CryptoLibrary.h"

namespace {

using Json = nlohmann::ordered_json;

// Large reads keep the host's side cheap: about 4 MiB, whole frames.
constexpr uint64_t kReadBytes = 4u << 20;

struct Layout {
    uint64_t frames = 0;
    uint64_t frameBytes = 0;
    unsigned int sampleBytes = 0;
};

/// Says on stderr what went wrong with the file; gives the failure exit.
int Refuse(const std::string& path, const std::string& what) {
    std::fprintf(stderr, "orlo: %s: %s\n", path.c_str(), what.c_str());
    return kExitFailed;
}

/// Reads exactly `size` bytes at `offset`, or says where the file ended.
bool ReadFully(int fd, unsigned char* buffer, uint64_t size, uint64_t offset, std::string& error) {
    uint64_t done = 0;
    while (done < size) {
        const ssize_t n = pread(fd, buffer + done, size - done, static_cast<off_t>(offset + done));
        if (n < 0 && errno == EINTR) continue;
        if (n < 0) {
            error = std::string("cannot read at byte ") + std::to_string(offset + done) + ": " + std::strerror(errno);
            return false;
        }
        if (n == 0) {
            error = "the file ends at byte " + std::to_string(offset + done) + ", before its audio does";
            return false;
        }
        done += static_cast<uint64_t>(n);
    }
    return true;
}

}  // namespace

CLI::App* ReadCommand::Declare(CLI::App& app) {
    CLI::App* command = app.add_subcommand(
        "read", "read the samples of an audio file through the plug-in's sample map, as a host does");
    command->add_option("FILE", m_Path, "a WAV, Broadcast Wave, RF64, AIFF or AIFF-C file")->required();
    auto* md5 = command->add_flag("--md5", m_Md5, "print the MD5 of the sample bytes as stored");
    auto* output = command->add_option("-o,--output", m_Output, "write the samples as a standard WAV file");
    md5->excludes(output);
    command->add_option("--channel", m_Channels, "only this channel, counted from 1 (repeatable)")
        ->check(CLI::PositiveNumber);
    command->add_flag("--json", m_Json, "one JSON object instead of text");
    command->add_option("--module", m_Module, "the plug-in module to load (default: the one beside orlo)");
    command->callback([md5, output] {
        if (md5->count() == 0 && output->count() == 0) throw CLI::RequiredError("--md5 or --output");
    });
    return command;
}

int ReadCommand::Run(const OrloOptions& options) {
    // The sample format is the file's, as its chunks say; where the samples lie is the map's.
    Orlo::OrloStream stream(m_Path.c_str(), Orlo::kAllChunks);
    if (stream.GetError()) return Refuse(m_Path, std::string("not a readable audio file: ") + stream.GetError());
    if (m_Module.empty()) m_Module = ModuleRun::DefaultModulePath();
    ModuleRun run(options.Verbosity(), PluginChoices(), m_Module);
    if (!run.Started()) return kExitFailed;

    TOVPtr<IMediaContainer3> container;
    TOVPtr<ISampleMapping> map;
    Layout layout;
    int status = kExitFailed;
    std::string error;
    Json report = {{"file", m_Path}};
    do {
        if (SayRefused(run.Host().CreateComponent(OrloRegInfo::CompID_OrloReaderMovContainer, nullptr,
                                                  IID_IMediaContainer3, container.Out()),
                       "the module made no container") < 0)
            break;
        ZEB::ZEBString path(reinterpret_cast<const unsigned char*>(m_Path.c_str()));
        if (container->SetFilePath(path.InArg()) < 0 || !container->IsContainerSupported()) {
            error = "the plug-in does not read it";
            break;
        }
        if (SayRefused(container->GetSampleMapping(map.OutT()), m_Path + ": no sample map") < 0) break;
        unsigned long long frames = 0, frameBytes = 0;
        if (map->GetNumberOfSamples(0, &frames) < 0 || map->GetSampleSize(0, 0, &frameBytes) < 0 || !frameBytes) {
            error = "the sample map has no media";
            break;
        }
        layout = {frames, frameBytes, static_cast<unsigned int>(frameBytes / stream.GetChannelCount())};
        status = kExitOK;
    } while (false);
    const uint16_t channelCount = stream.GetChannelCount();
    if (status == kExitOK && layout.sampleBytes * channelCount != layout.frameBytes) {
        status = kExitFailed;
        error = "the sample map's frame size does not match the file's format";
    }
    std::vector<unsigned int> chosen = m_Channels;
    if (chosen.empty())
        for (unsigned int c = 1; c <= channelCount; ++c) chosen.push_back(c);
    for (unsigned int c : chosen)
        if (status == kExitOK && c > channelCount) {
            status = kExitFailed;
            error = "there is no channel " + std::to_string(c) + " (the file has " + std::to_string(channelCount) + ")";
        }
    if (status != kExitOK) {
        map.Reset();
        container.Reset();
        run.Stop();
        return error.empty() ? kExitFailed : Refuse(m_Path, error);
    }

    const bool allChannels = chosen.size() == channelCount && m_Channels.empty();
    const bool swap = !m_Output.empty() && stream.GetIsDataWrongEndian();
    std::unique_ptr<WavOutput> wav;
    if (!m_Output.empty()) {
        wav = std::make_unique<WavOutput>(
            m_Output,
            WavOutput::Format{static_cast<uint16_t>(chosen.size()), static_cast<uint32_t>(stream.GetSampleRate()),
                              static_cast<uint16_t>(layout.sampleBytes * 8), stream.GetIsDataFloatingPoint()},
            layout.frames);
        if (!wav->Error().empty()) return Refuse(m_Path, wav->Error());
    }
    const CryptoLibrary* crypto = m_Md5 ? CryptoLibrary::Get() : nullptr;
    if (m_Md5 && !crypto) return Refuse(m_Path, "no MD5: OpenSSL's libcrypto cannot be loaded");
    const auto freeDigest = [crypto](EVP_MD_CTX* context) { crypto->MD_CTX_free(context); };
    std::unique_ptr<EVP_MD_CTX, decltype(freeDigest)> md5(m_Md5 ? crypto->MD_CTX_new() : nullptr, freeDigest);
    if (m_Md5 && (!md5 || crypto->DigestInit_ex(md5.get(), crypto->md5(), nullptr) != 1))
        return Refuse(m_Path, "no MD5: the digest cannot be started");

    const int fd = open(m_Path.c_str(), O_RDONLY | O_CLOEXEC);
    if (fd < 0) return Refuse(m_Path, std::string("cannot open: ") + std::strerror(errno));
    posix_fadvise(fd, 0, 0, POSIX_FADV_SEQUENTIAL);
    const uint64_t chunkFrames = std::max<uint64_t>(1, kReadBytes / layout.frameBytes);
    std::vector<unsigned char> buffer(chunkFrames * layout.frameBytes);
    std::vector<unsigned char> picked(allChannels && !swap ? 0 : chunkFrames * chosen.size() * layout.sampleBytes);
    ProgressBar progress(layout.frames);
    uint64_t frame = 0;
    while (frame < layout.frames && error.empty()) {
        unsigned long long contiguous = 0, position = 0;
        if (map->GetNumberOfContiguousBytes(0, frame, &contiguous) < 0 ||
            map->GetSamplePosition(0, frame, &position) < 0) {
            error = "the sample map has no position for frame " + std::to_string(frame);
            break;
        }
        const uint64_t count = std::min<uint64_t>(chunkFrames, contiguous / layout.frameBytes);
        if (count == 0 || !ReadFully(fd, buffer.data(), count * layout.frameBytes, position, error)) {
            if (error.empty()) error = "the sample map gives no bytes at frame " + std::to_string(frame);
            break;
        }
        const unsigned char* bytes = buffer.data();
        size_t size = count * layout.frameBytes;
        if (!picked.empty()) {
            // Only the chosen channels, in the order asked, swapped to little-endian for a WAV.
            unsigned char* out = picked.data();
            for (uint64_t f = 0; f < count; ++f) {
                const unsigned char* in = buffer.data() + f * layout.frameBytes;
                for (unsigned int c : chosen) {
                    const unsigned char* sample = in + (c - 1) * layout.sampleBytes;
                    for (unsigned int b = 0; b < layout.sampleBytes; ++b)
                        *out++ = sample[swap ? layout.sampleBytes - 1 - b : b];
                }
            }
            bytes = picked.data();
            size = static_cast<size_t>(out - picked.data());
        }
        if (m_Md5) crypto->DigestUpdate(md5.get(), bytes, size);
        if (wav && !wav->Write(bytes, size)) error = wav->Error();
        frame += count;
        progress.Update(frame);
    }
    close(fd);
    if (wav && !wav->Close() && error.empty()) error = wav->Error();
    map.Reset();
    container.Reset();
    report["console"] = run.Stop();
    if (!error.empty()) return Refuse(m_Path, error);

    Json channels = Json::array();
    for (unsigned int c : chosen) channels.push_back(c);
    report["frames"] = layout.frames;
    report["channels"] = channels;
    std::string digest;
    if (m_Md5) {
        unsigned char value[EVP_MAX_MD_SIZE];
        unsigned int length = 0;
        crypto->DigestFinal_ex(md5.get(), value, &length);
        digest = ZEB::HexText(value, length, ZEB::HexCase::Lower);
        report["md5"] = digest;
    } else {
        report["output"] = m_Output;
    }
    if (m_Json)
        std::printf("%s\n", JsonDump(report, 2).c_str());
    else if (m_Md5)
        std::printf("%s  %s\n", digest.c_str(), m_Path.c_str());
    else
        std::printf("wrote %llu frames of %zu channels to %s\n", static_cast<unsigned long long>(layout.frames),
                    chosen.size(), m_Output.c_str());
    return kExitOK;
}
