// libFuzzer target: the whole chunk walk, and every accessor after it, over
// any bytes. Each input is written to a memory file that the stream opens by
// path, as it opens any file.
#include <fcntl.h>
#include <unistd.h>

#include <cstdint>
#include <cstdlib>
#include <stdexcept>
#include <string>

#include "FuzzHost.h"
#include "FuzzInputFile.h"
#include "reader/OrloStream.h"

namespace {

FuzzInputFile* g_input = nullptr;

// The lowest free descriptor: a stream that left its file open takes it.
int LowestFreeDescriptor() {
    const int fd = open("/dev/null", O_RDONLY);
    close(fd);
    return fd;
}

template <typename Get>
void Ask(Get get) {
    try {
        get();
    } catch (const std::exception&) {
        // "value does not exist": the answer of a stream without the chunk.
    }
}

}  // namespace

extern "C" int LLVMFuzzerInitialize(int*, char***) {
    // The reader logs through the utility library, which needs a host.
    StartFuzzHost();
    g_input = new FuzzInputFile("orlo-fuzz");
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
    g_input->Write(data, size);

    const int free = LowestFreeDescriptor();
    {
        const Orlo::OrloStream stream(g_input->Path().c_str(), Orlo::kAllChunks);
        Ask([&] { return stream.GetChannelCount(); });
        Ask([&] { return stream.GetBitsPerSample(); });
        Ask([&] { return stream.GetIsDataFloatingPoint(); });
        Ask([&] { return stream.GetSampleRate(); });
        Ask([&] { return stream.GetSampleCount(); });
        Ask([&] { return stream.GetIsDataWrongEndian(); });
        Ask([&] { return stream.GetSampleSize(); });
        Ask([&] { return stream.GetStartPosition(); });
        Ask([&] { return stream.GetSamplePosition(1000); });
    }

    if (LowestFreeDescriptor() != free) std::abort();  // the stream left its file open
    return 0;
}
