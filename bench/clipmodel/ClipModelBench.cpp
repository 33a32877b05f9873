// Making the Movie of one file as the container does for the host, in
// process with the plug-in started. A Broadcast Wave take with bext and a
// 4 KB iXML document must take well under 150 microseconds, and the same
// take as a 5 GiB RF64 file no more than a tenth longer: nothing may depend
// on the amount of audio. bench_reader times the chunk walk alone.
#include <benchmark/benchmark.h>
#include <unistd.h>

#include <cstdio>
#include <string>

#include "AudioFileWriter.h"
#include "ChunkPayloads.h"
#include "ExampleTake.h"
#include "TempFile.h"
#include "boundary/NewMovieFromFilePath.h"
#include "boundary/PluginStartup.h"
#include "startup/ZEBUtilLib.h"
#include "tov/host/TOVHost.h"

namespace {

constexpr size_t kIxmlSize = 4096;
constexpr uint64_t kRF64Data = 5ull << 30;

// The writer's default format: 48 kHz, 24-bit stereo PCM.
const Payload::Fmt kStereoFmt;

std::string BroadcastWave() {
    return AudioFileWriter::Wave()
        .Chunk("bext", ExampleTake::BextPayload())
        .Chunk("fmt ", Payload::FmtChunk(kStereoFmt))
        .Chunk("iXML", ExampleTake::IxmlPayload(kIxmlSize))
        .Chunk("data", ExampleTake::Samples())
        .Bytes();
}

// The chunks before the samples; the file is then stretched to hold them.
std::string RF64Head() {
    return AudioFileWriter::RF64()
        .Chunk("ds64", Payload::Ds64Chunk(0, kRF64Data, kRF64Data / 6))
        .Chunk("bext", ExampleTake::BextPayload())
        .Chunk("fmt ", Payload::FmtChunk(kStereoFmt))
        .Chunk("iXML", ExampleTake::IxmlPayload(kIxmlSize))
        .ChunkWithSize("data", 0xFFFFFFFF, "", false)
        .Bytes();
}

struct Files {
    Files() : broadcast(BroadcastWave()), rf64(RF64Head()), exampleTake(ExampleTake::File()) {
        // A hole: the samples take no disk space.
        if (truncate(rf64.Path().c_str(), static_cast<off_t>(RF64Head().size() + kRF64Data)) != 0)
            std::perror("truncate");
    }
    TempFile broadcast;
    TempFile rf64;
    TempFile exampleTake;
};

Files* g_files = nullptr;
TOVHost* g_host = nullptr;

void MakeMovie(benchmark::State& state, const TempFile& file) {
    const ZEB::ZEBString path(reinterpret_cast<const unsigned char*>(file.Path().c_str()));
    for (auto _ : state) {
        OrloReader::Movie* movie = nullptr;
        if (ZEB::Impl::NewMovieFromFilePath(path, &movie, g_host) != TOV_OK) state.SkipWithError("no Movie");
        benchmark::DoNotOptimize(movie);
        delete movie;
    }
}

void BM_MovieBroadcastWaveWithBextAndIxml(benchmark::State& state) { MakeMovie(state, g_files->broadcast); }
void BM_MovieRF64_5GiBWithBextAndIxml(benchmark::State& state) { MakeMovie(state, g_files->rf64); }
void BM_MovieExampleTake(benchmark::State& state) { MakeMovie(state, g_files->exampleTake); }

BENCHMARK(BM_MovieBroadcastWaveWithBextAndIxml);
BENCHMARK(BM_MovieRF64_5GiBWithBextAndIxml);
BENCHMARK(BM_MovieExampleTake);

}  // namespace

int main(int argc, char** argv) {
    // The console shows what a user sees by default, into nothing.
    TOVPtr<TOVHost> host = TOVHost::Create();
    host->Console().SetSink([](uint32_t, const std::string&) {});
    if (ZEB::ZEBInitialize(host.Get()) < 0) return 1;
    int status = 0;
    {
        PluginStartup plugin(host->AsUnknown());
        Files files;
        g_files = &files;
        g_host = host.Get();
        benchmark::Initialize(&argc, argv);
        if (plugin.Result() < 0 || benchmark::ReportUnrecognizedArguments(argc, argv)) {
            status = 1;
        } else {
            benchmark::RunSpecifiedBenchmarks();
        }
        benchmark::Shutdown();
        g_files = nullptr;
        g_host = nullptr;
    }
    ZEB::ZEBTerminate();
    return status;
}
