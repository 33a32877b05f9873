// Opening files through the chunk stream. The walk seeks over samples, so a
// 5 GiB RF64 file must open as fast as a 1 MB WAV, and a Broadcast Wave file
// with bext and iXML, such as the example take (its iXML behind the samples),
// in well under 10 microseconds: little more than opening the file, reading
// a few kilobytes and closing it. Samples are read only when a data size of 0
// makes the walk go through them.
#include <benchmark/benchmark.h>
#include <unistd.h>

#include <cstdio>
#include <string>

#include "AudioFileWriter.h"
#include "ChunkPayloads.h"
#include "ExampleTake.h"
#include "TempFile.h"
#include "reader/OrloStream.h"
#include "startup/ZEBUtilLib.h"
#include "tov/host/TOVHost.h"

namespace {

Payload::Fmt StereoFmt() {
    Payload::Fmt fmt;
    fmt.channels = 2;
    fmt.bits = 24;
    return fmt;
}

std::string Ixml() {
    std::string tracks;
    for (int i = 1; i <= 8; ++i)
        tracks += "<TRACK><CHANNEL_INDEX>" + std::to_string(i) + "</CHANNEL_INDEX><INTERLEAVE_INDEX>" +
                  std::to_string(i) + "</INTERLEAVE_INDEX><NAME>Track " + std::to_string(i) + "</NAME></TRACK>";
    return "<?xml version=\"1.0\" encoding=\"UTF-8\"?><BWFXML><IXML_VERSION>1.61</IXML_VERSION><PROJECT>Orlo</PROJECT>"
           "<SCENE>12A</SCENE><TAKE>3</TAKE><TAPE>DAY01</TAPE><CIRCLED>TRUE</CIRCLED><SPEED><TIMECODE_RATE>25/1"
           "</TIMECODE_RATE><TIMECODE_FLAG>NDF</TIMECODE_FLAG></SPEED><TRACK_LIST><TRACK_COUNT>8</TRACK_COUNT>" +
           tracks + "</TRACK_LIST></BWFXML>" + std::string(1024, ' ');
}

std::string Wave1MB() {
    return AudioFileWriter::Wave()
        .Chunk("fmt ", Payload::FmtChunk(StereoFmt()))
        .Chunk("data", std::string(1 << 20, '\x11'))
        .Bytes();
}

constexpr uint64_t kRF64Data = 5ull << 30;

// The chunks before the samples; the file is then stretched to hold them.
std::string RF64Head() {
    return AudioFileWriter::RF64()
        .Chunk("ds64", Payload::Ds64Chunk(0, kRF64Data, kRF64Data / 6))
        .Chunk("fmt ", Payload::FmtChunk(StereoFmt()))
        .ChunkWithSize("data", 0xFFFFFFFF, "", false)
        .Bytes();
}

std::string BroadcastWave() {
    Payload::Bext bext;
    bext.description = "sSCENE=12A\r\nsTAKE=3\r\nsTAPE=DAY01\r\nsNOTE=wind\r\n";
    bext.umid = std::string(64, '\x05');
    bext.codingHistory = "A=PCM,F=48000,W=24,M=stereo,T=recorder\r\n";
    return AudioFileWriter::Wave()
        .Chunk("bext", Payload::BextChunk(bext))
        .Chunk("iXML", Ixml())
        .Chunk("fmt ", Payload::FmtChunk(StereoFmt()))
        .Chunk("data", std::string(1 << 20, '\x11'))
        .Bytes();
}

constexpr uint64_t kSilence = 64ull << 20;

// A data size never written: the walk reads the samples as chunks, and 64 MiB
// of digital silence as empty ones.
std::string SilenceHead() {
    return AudioFileWriter::Wave()
        .Chunk("fmt ", Payload::FmtChunk(StereoFmt()))
        .ChunkWithSize("data", 0, "", false)
        .Bytes();
}

// Sparse: the samples take no disk space.
void Stretch(const TempFile& file, uint64_t size) {
    if (truncate(file.Path().c_str(), static_cast<off_t>(size)) != 0) std::perror("truncate");
}

struct Files {
    Files()
        : wave(Wave1MB()),
          rf64(RF64Head()),
          broadcast(BroadcastWave()),
          exampleTake(ExampleTake::File()),
          silence(SilenceHead()) {
        Stretch(rf64, RF64Head().size() + kRF64Data);
        Stretch(silence, SilenceHead().size() + kSilence);
    }
    TempFile wave;
    TempFile rf64;
    TempFile broadcast;
    TempFile exampleTake;
    TempFile silence;
};

Files* g_files = nullptr;

void Open(benchmark::State& state, const TempFile& file) {
    for (auto _ : state) {
        Orlo::OrloStream stream(file.Path().c_str(), Orlo::kAllChunks);
        if (stream.GetError()) state.SkipWithError(stream.GetError());
        benchmark::DoNotOptimize(stream.GetSampleCount());
    }
}

void BM_OpenWave1MB(benchmark::State& state) { Open(state, g_files->wave); }
void BM_OpenRF64_5GiB(benchmark::State& state) { Open(state, g_files->rf64); }
void BM_OpenBroadcastWaveWithBextAndIxml(benchmark::State& state) { Open(state, g_files->broadcast); }
void BM_OpenExampleTake(benchmark::State& state) { Open(state, g_files->exampleTake); }
void BM_OpenSilenceWithoutDataSize64MiB(benchmark::State& state) {
    Open(state, g_files->silence);
    state.SetBytesProcessed(static_cast<int64_t>(state.iterations() * kSilence));
}

BENCHMARK(BM_OpenWave1MB);
BENCHMARK(BM_OpenRF64_5GiB);
BENCHMARK(BM_OpenBroadcastWaveWithBextAndIxml);
BENCHMARK(BM_OpenExampleTake);
BENCHMARK(BM_OpenSilenceWithoutDataSize64MiB)->Unit(benchmark::kMillisecond);

}  // namespace

int main(int argc, char** argv) {
    // The reader logs through the utility library, which needs a host; its
    // console shows what a user sees by default, into nothing.
    TOVPtr<TOVHost> host = TOVHost::Create();
    host->Console().SetSink([](uint32_t, const std::string&) {});
    if (ZEB::ZEBInitialize(host.Get()) < 0) return 1;
    Files files;
    g_files = &files;
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv)) return 1;
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    g_files = nullptr;
    ZEB::ZEBTerminate();
    return 0;
}
