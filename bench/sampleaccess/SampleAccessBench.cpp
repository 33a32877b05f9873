// Reading through the sample map, as the host does after GetSampleMapping.
// A frame position must cost at most 5 ns and allocate nothing (the counter
// allocs_per_call); reading every frame of a 1 GiB file from the page cache at
// the map's positions, in reads of 1 to 4 MiB planned by its contiguous byte
// counts, must reach at least 0.8 of the throughput of a plain pread loop over
// the same bytes. The file is written at start in $TMPDIR (else /tmp) and
// removed at the end. Compare medians: --benchmark_repetitions=5.
#include <benchmark/benchmark.h>
#include <fcntl.h>
#include <unistd.h>

#include <algorithm>
#include <atomic>
#include <cstdlib>
#include <memory>
#include <new>
#include <string>
#include <vector>

#include "AudioFileWriter.h"
#include "ChunkPayloads.h"
#include "TempFile.h"
#include "boundary/OrloRegInfo.h"
#include "boundary/PluginStartup.h"
#include "sampleaccess/OrloReaderSampleMapping.h"
#include "startup/ZEBUtilLib.h"
#include "tov/host/TOVHost.h"

namespace {

std::atomic<uint64_t> g_allocations{0};

}  // namespace

// Every allocation of the process is counted. Not inlined, so the compiler
// pairs these as new and delete rather than as malloc and delete.
__attribute__((noinline)) void* operator new(std::size_t size) {
    g_allocations.fetch_add(1, std::memory_order_relaxed);
    if (void* p = std::malloc(size ? size : 1)) return p;
    throw std::bad_alloc();
}
__attribute__((noinline)) void operator delete(void* p) noexcept { std::free(p); }
__attribute__((noinline)) void operator delete(void* p, std::size_t) noexcept { std::free(p); }

namespace {

// 48 kHz, 24-bit stereo: 6 bytes a frame, as many whole frames as fit in 1 GiB.
const Payload::Fmt kStereoFmt;
constexpr uint64_t kFrameBytes = 6;
constexpr uint64_t kDataBytes = (1ull << 30) / kFrameBytes * kFrameBytes;
constexpr size_t kBlock = 4u << 20;

// The header is written first, then the samples block by block.
std::unique_ptr<TempFile> WriteGiBFile() {
    const std::string head = AudioFileWriter::Wave()
                                 .Chunk("fmt ", Payload::FmtChunk(kStereoFmt))
                                 .ChunkWithSize("data", static_cast<uint32_t>(kDataBytes), "", false)
                                 .Bytes();
    auto file = std::make_unique<TempFile>(head);
    std::string block(kBlock, '\0');
    for (size_t i = 0; i < block.size(); ++i) block[i] = static_cast<char>(i * 131 + i / 251);
    for (uint64_t done = 0; done < kDataBytes; done += kBlock)
        file->WriteAt(head.size() + done, block.substr(0, std::min<uint64_t>(kBlock, kDataBytes - done)));
    return file;
}

struct Fixture {
    ISampleMapping* map = nullptr;
    int fd = -1;
    unsigned long long start = 0;
};
Fixture g;

void BM_SamplePosition(benchmark::State& state) {
    unsigned long long position = 0;
    unsigned long long n = 0;
    const uint64_t before = g_allocations.load();
    for (auto _ : state) {
        g.map->GetSamplePosition(0, n++ & 0xFFFFF, &position);
        benchmark::DoNotOptimize(position);
    }
    state.counters["allocs_per_call"] =
        benchmark::Counter(static_cast<double>(g_allocations.load() - before), benchmark::Counter::kAvgIterations);
}
BENCHMARK(BM_SamplePosition);

// Each read a whole number of frames, at most the argument in MiB.
uint64_t ReadSize(const benchmark::State& state) {
    return (static_cast<uint64_t>(state.range(0)) << 20) / kFrameBytes * kFrameBytes;
}

void ReadAll(benchmark::State& state, std::vector<char>& buffer, uint64_t bytes, uint64_t position) {
    if (pread(g.fd, buffer.data(), bytes, static_cast<off_t>(position)) != static_cast<ssize_t>(bytes))
        state.SkipWithError("short read");
}

void BM_ReadThroughMap(benchmark::State& state) {
    const uint64_t readSize = ReadSize(state);
    std::vector<char> buffer(readSize);
    for (auto _ : state) {
        unsigned long long n = 0;
        unsigned long long run = 0;
        unsigned long long position = 0;
        while (g.map->GetNumberOfContiguousBytes(0, n, &run) == TOV_OK) {
            const uint64_t bytes = std::min<uint64_t>(run, readSize);
            g.map->GetSamplePosition(0, n, &position);
            ReadAll(state, buffer, bytes, position);
            n += bytes / kFrameBytes;
        }
    }
    state.SetBytesProcessed(static_cast<int64_t>(state.iterations() * kDataBytes));
}

void BM_PlainPread(benchmark::State& state) {
    const uint64_t readSize = ReadSize(state);
    std::vector<char> buffer(readSize);
    for (auto _ : state) {
        for (uint64_t done = 0; done < kDataBytes; done += readSize)
            ReadAll(state, buffer, std::min(readSize, kDataBytes - done), g.start + done);
    }
    state.SetBytesProcessed(static_cast<int64_t>(state.iterations() * kDataBytes));
}

BENCHMARK(BM_ReadThroughMap)->Arg(1)->Arg(4)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(BM_PlainPread)->Arg(1)->Arg(4)->Unit(benchmark::kMillisecond)->UseRealTime();

}  // namespace

int main(int argc, char** argv) {
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv)) return 1;
    TOVPtr<TOVHost> host = TOVHost::Create();
    host->Console().SetSink([](uint32_t, const std::string&) {});
    if (ZEB::ZEBInitialize(host.Get()) < 0) return 1;
    int status = 1;
    {
        PluginStartup plugin(host->AsUnknown());
        std::unique_ptr<TempFile> file = WriteGiBFile();
        TOVPtr<ISampleMapping> map;
        host->RegisterBuiltin(OrloRegInfo::CompID_OrloReaderMovSampleMapping,
                              OrloRegInfo::CLSID_OrloReaderMovSampleMapping, L"OrloReaderSampleMapping",
                              &ZEB::Impl::OrloReaderSampleMapping::TOVCreate);
        const bool made = plugin.Result() == TOV_OK &&
                          host->CreateComponent(OrloRegInfo::CompID_OrloReaderMovSampleMapping, nullptr,
                                                IID_ISampleMapping, map.Out()) == TOV_OK &&
                          dynamic_cast<ZEB::Impl::OrloReaderSampleMapping&>(*map).SetFilePath(
                              ZEB::ZEBString(reinterpret_cast<const unsigned char*>(file->Path().c_str())));
        g.fd = open(file->Path().c_str(), O_RDONLY);
        if (made && g.fd >= 0 && map->GetSamplePosition(0, 0, &g.start) == TOV_OK) {
            g.map = map.Get();
            std::vector<char> warm(kBlock);
            for (uint64_t done = 0; done < kDataBytes; done += kBlock)
                if (pread(g.fd, warm.data(), kBlock, static_cast<off_t>(g.start + done)) < 0) break;
            benchmark::RunSpecifiedBenchmarks();
            status = 0;
        }
        if (g.fd >= 0) close(g.fd);
        g = Fixture();
    }
    benchmark::Shutdown();
    ZEB::ZEBTerminate();
    return status;
}
