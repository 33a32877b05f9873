// Writes the example take: make_example_take DIR writes DIR/12A-T03.wav.
#include <cstdio>
#include <fstream>
#include <string>

#include "ExampleTake.h"

int main(int argc, char** argv) {
    if (argc != 2) {
        std::fprintf(stderr, "usage: make_example_take DIR\n");
        return 2;
    }
    const std::string path = std::string(argv[1]) + "/" + ExampleTake::kFileName;
    std::ofstream out(path, std::ios::binary);
    const std::string bytes = ExampleTake::File();
    out.write(bytes.data(), static_cast<std::streamsize>(bytes.size()));
    if (!out.flush()) {
        std::fprintf(stderr, "make_example_take: cannot write %s\n", path.c_str());
        return 1;
    }
    std::printf("%s: %zu bytes\n", path.c_str(), bytes.size());
    return 0;
}
