// The link of the example take as a host makes it, through the loaded
// module's components: SetFilePath, IsContainerSupported, GetAAFMasterClips,
// GetMetadata(0) and GetSampleMapping on a fresh container each time. The
// whole must take at most 100 microseconds (median); the stages are timed
// apart as well, each on a container brought untimed up to it.
#include <benchmark/benchmark.h>

#include <cstdlib>
#include <string>

#include "ExampleTake.h"
#include "TempFile.h"
#include "boundary/OrloRegInfo.h"
#include "startup/ZEBUtilLib.h"
#include "strings/ZEBString.h"
#include "tov/IMediaContainer3.h"
#include "tov/host/TOVHost.h"

namespace {

struct Linker {
    Linker() : host(TOVHost::Create()), take(ExampleTake::File()) {
        host->Console().SetVerbosity(0);
        if (ZEB::ZEBInitialize(host.Get()) < 0) std::abort();
        std::string error;
        if (host->LoadModule(ORLO_MODULE, error) < 0) std::abort();
        path = ZEB::ZEBString(reinterpret_cast<const unsigned char*>(take.Path().c_str()));
    }
    ~Linker() {
        ZEB::ZEBTerminate();
        host->UnloadAllModules();
    }
    TOVPtr<IMediaContainer3> Container() {
        TOVPtr<IMediaContainer3> container;
        if (host->CreateComponent(OrloRegInfo::CompID_OrloReaderMovContainer, nullptr, IID_IMediaContainer3,
                                  container.Out()) < 0)
            std::abort();
        return container;
    }
    TOVPtr<TOVHost> host;
    TempFile take;
    ZEB::ZEBString path;
};

Linker& TheLinker() {
    static Linker linker;
    return linker;
}

enum Stage { kWhole, kSupport, kClips, kMap };

void BM_Link(benchmark::State& state) {
    Linker& linker = TheLinker();
    const auto stage = static_cast<Stage>(state.range(0));
    for (auto _ : state) {
        state.PauseTiming();
        TOVPtr<IMediaContainer3> container = linker.Container();
        if (stage == kClips || stage == kMap) {
            container->SetFilePath(linker.path.InArg());
            container->IsContainerSupported();
        }
        if (stage == kMap) {
            TOVPtr<IAAFClips> clips;
            container->GetAAFMasterClips(clips.OutT());
        }
        state.ResumeTiming();
        if (stage == kWhole || stage == kSupport) {
            container->SetFilePath(linker.path.InArg());
            if (container->IsContainerSupported() != 1) std::abort();
        }
        if (stage == kWhole || stage == kClips) {
            TOVPtr<IAAFClips> clips;
            IAAFFile* file = nullptr;
            if (container->GetAAFMasterClips(clips.OutT()) != 0 || clips->GetMetadata(0, &file) != 0) std::abort();
            file->Release();
        }
        if (stage == kWhole || stage == kMap) {
            TOVPtr<ISampleMapping> map;
            if (container->GetSampleMapping(map.OutT()) != 0) std::abort();
        }
        state.PauseTiming();
        container.Reset();
        state.ResumeTiming();
    }
}
BENCHMARK(BM_Link)
    ->ArgName("stage")
    ->Arg(kWhole)
    ->Arg(kSupport)
    ->Arg(kClips)
    ->Arg(kMap)
    ->Unit(benchmark::kMicrosecond)
    ->Repetitions(5)
    ->ReportAggregatesOnly(true);

}  // namespace

BENCHMARK_MAIN();
