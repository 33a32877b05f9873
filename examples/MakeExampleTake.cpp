// Writes the examples: make_example_take DIR writes DIR/12A-T03.wav and the
// group's files in DIR/group/.
#include <sys/stat.h>

#include <cstdio>
#include <fstream>
#include <string>

#include "ExampleGroup.h"
#include "ExampleTake.h"

namespace {

bool Write(const std::string& path, const std::string& bytes) {
    std::ofstream out(path, std::ios::binary);
    out.write(bytes.data(), static_cast<std::streamsize>(bytes.size()));
    if (!out.flush()) {
        std::fprintf(stderr, "make_example_take: cannot write %s\n", path.c_str());
        return false;
    }
    std::printf("%s: %zu bytes\n", path.c_str(), bytes.size());
    return true;
}

}  // namespace

int main(int argc, char** argv) {
    if (argc != 2) {
        std::fprintf(stderr, "usage: make_example_take DIR\n");
        return 2;
    }
    const std::string folder = argv[1];
    if (!Write(folder + "/" + ExampleTake::kFileName, ExampleTake::File())) return 1;
    const std::string group = folder + "/" + ExampleGroup::kFolder;
    mkdir(group.c_str(), 0777);
    for (int channel = 1; channel <= ExampleGroup::kChannels; ++channel)
        if (!Write(group + "/" + ExampleGroup::FileName(channel), ExampleGroup::File(channel))) return 1;
    return 0;
}
