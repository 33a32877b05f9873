// libFuzzer target: the link of one file as a host makes it. Each input is
// written as a file and taken through the container (path, support test, clip
// list with its AAF file) and the sample map, whose answers must hang together.
#include <cstdint>
#include <cstdlib>

#include "FuzzHost.h"
#include "FuzzInputFile.h"
#include "boundary/OrloComponents.h"
#include "boundary/OrloRegInfo.h"
#include "boundary/PluginStartup.h"
#include "strings/ZEBString.h"
#include "tov/IMediaContainer3.h"

namespace {

TOVHost* g_host = nullptr;
FuzzInputFile* g_input = nullptr;

// The map of a file with media: frames lie one frame apart from the start, and
// the run from frame 0 holds them all.
void CheckMap(ISampleMapping& map) {
    unsigned long long frames = 0, frameBytes = 0, first = 0, last = 0, run = 0;
    if (map.GetNumberOfSamples(0, &frames) < 0 || map.GetSampleSize(0, 0, &frameBytes) < 0) return;
    map.GetSamplePosition(0, 0, &first);
    map.GetSamplePosition(0, ~0ull, &last);  // past the end: still an answer, never a fault
    if (frames == 0) {
        if (map.GetNumberOfContiguousBytes(0, 0, &run) != TOV_E_OUTOFRANGE) std::abort();
        return;
    }
    if (map.GetSamplePosition(0, frames - 1, &last) < 0 || last != first + (frames - 1) * frameBytes) std::abort();
    const TOVRESULT result = map.GetNumberOfContiguousBytes(0, 0, &run);
    if (result >= 0 && run != frames * frameBytes) std::abort();
}

}  // namespace

extern "C" int LLVMFuzzerInitialize(int*, char***) {
    g_host = StartFuzzHost();
    // The components as the module registers them, built into this process.
    for (const OrloComponent& component : kOrloComponents)
        if (component.creator &&
            g_host->RegisterBuiltin(component.compID, component.clsid, component.name, component.creator) < 0)
            std::abort();
    static PluginStartup startup(g_host->AsUnknown());
    if (startup.Result() != TOV_OK) std::abort();
    g_input = new FuzzInputFile("orlo-fuzz-link");
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
    g_input->Write(data, size);
    TOVPtr<IMediaContainer3> container;
    if (g_host->CreateComponent(OrloRegInfo::CompID_OrloReaderMovContainer, nullptr, IID_IMediaContainer3,
                                container.Out()) < 0)
        std::abort();
    ZEB::ZEBString path(reinterpret_cast<const unsigned char*>(g_input->Path().c_str()));
    if (container->SetFilePath(path.InArg()) != TOV_OK) std::abort();
    const bool supported = container->IsContainerSupported() == 1;

    TOVPtr<IAAFClips> clips;
    if (container->GetAAFMasterClips(clips.OutT()) == TOV_OK) {
        IAAFFile* file = nullptr;
        if (clips->Count() != 1 || clips->GetMetadata(0, &file) != TOV_OK || !file) std::abort();
        file->Release();
    }
    TOVPtr<ISampleMapping> map;
    // A map is made even for a file that is not audio: the host has no other
    // container to take it. One that lacks the chunks for an answer fails.
    const TOVRESULT mapped = container->GetSampleMapping(map.OutT());
    if (mapped == TOV_OK && !map) std::abort();
    if (mapped == TOV_OK && supported) CheckMap(*map);
    return 0;
}
