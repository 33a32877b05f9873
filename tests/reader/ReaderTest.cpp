#include "ReaderTest.h"

#include <dirent.h>

#include "TempFile.h"
#include "startup/ZEBUtilLib.h"

namespace {
// How many descriptors the process holds open.
int OpenDescriptorCount() {
    DIR* folder = opendir("/proc/self/fd");
    if (!folder) return -1;
    int count = 0;
    while (readdir(folder)) ++count;
    closedir(folder);
    return count;
}
}  // namespace

void ReaderFixture::SetUp() {
    ASSERT_EQ(ZEB::ZEBInitialize(host.Get()), TOV_OK);
    host.ClearLines();
}

void ReaderFixture::TearDown() { ZEB::ZEBTerminate(); }

std::unique_ptr<Orlo::OrloStream> ReaderFixture::Open(const std::string& bytes) {
    TempFile file(bytes);
    const int before = OpenDescriptorCount();
    auto stream = std::make_unique<Orlo::OrloStream>(file.Path().c_str(), Orlo::kAllChunks);
    EXPECT_EQ(OpenDescriptorCount(), before) << "the stream must close its file on every path";
    return stream;
}

std::string ReaderFixture::ErrorOf(const std::string& bytes) {
    const char* error = Open(bytes)->GetError();
    return error ? error : "";
}
