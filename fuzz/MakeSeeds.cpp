// Writes the seed corpus of the chunk-walk fuzzer into the folder given: one
// file of each kind the reader knows, and a few malformed ones.
#include <cstdio>
#include <string>
#include <utility>
#include <vector>

#include "AudioFileWriter.h"
#include "Bytes.h"
#include "ChunkPayloads.h"

namespace {

std::string Wave(const Payload::Fmt& fmt, const std::string& samples) {
    return AudioFileWriter::Wave().Chunk("fmt ", Payload::FmtChunk(fmt)).Chunk("data", samples).Bytes();
}

Payload::Fmt Fmt(uint16_t code, uint16_t bits, uint16_t subFormat = 1) {
    Payload::Fmt fmt;
    fmt.code = code;
    fmt.bits = bits;
    fmt.subFormat = subFormat;
    return fmt;
}

std::string Aifc(const std::string& compression, uint16_t bits) {
    Payload::Comm comm;
    comm.frames = 4;
    comm.bits = bits;
    comm.compression = compression;
    return AudioFileWriter::Aifc()
        .Chunk("COMM", Payload::CommChunk(comm))
        .Chunk("SSND", Payload::SsndChunk(0, std::string(16, '\x11')))
        .Bytes();
}

std::vector<std::pair<std::string, std::string>> Seeds() {
    const std::string samples(48, '\x22');
    Payload::Bext bext;
    bext.description = "sSCENE=12A\r\nsTAKE=3\r\nsNOTE=\"x\"\r\n";
    bext.version = 2;
    bext.umid = std::string(64, '\x05');
    bext.codingHistory = "A=PCM,F=48000,W=24\r\n";
    Payload::Comm comm;
    comm.frames = 4;
    return {
        {"wave16.wav", Wave(Fmt(1, 16), samples)},
        {"wave24.wav", Wave(Fmt(1, 24), samples)},
        {"float32.wav", Wave(Fmt(3, 32), samples)},
        {"extensible.wav", Wave(Fmt(0xFFFE, 24, 1), samples)},
        {"broadcast.wav", AudioFileWriter::Wave()
                              .Chunk("bext", Payload::BextChunk(bext))
                              .Chunk("fmt ", Payload::FmtChunk(Fmt(1, 24)))
                              .Chunk("iXML", "<?xml version=\"1.0\"?><BWFXML><SCENE>1</SCENE></BWFXML>")
                              .Chunk("data", samples)
                              .Chunk("umid", std::string(24, '\x07'))
                              .Bytes()},
        {"rf64.wav", AudioFileWriter::RF64()
                         .Chunk("ds64", Payload::Ds64Chunk(100, samples.size(), 8, 1))
                         .Chunk("fmt ", Payload::FmtChunk(Fmt(1, 24)))
                         .ChunkWithSize("data", 0xFFFFFFFF, samples, false)
                         .Bytes()},
        {"aiff16.aif", AudioFileWriter::Aiff()
                           .Chunk("COMM", Payload::CommChunk(comm))
                           .Chunk("SSND", Payload::SsndChunk(8, std::string(16, '\x11')))
                           .Bytes()},
        {"sowt.aifc", Aifc("sowt", 16)},
        {"fl32.aifc", Aifc("fl32", 32)},
        {"in24.aifc", Aifc("in24", 16)},
        {"odd.wav", AudioFileWriter::Wave()
                        .ChunkWithSize("JUNK", 3, "abc", false)
                        .Chunk("fmt ", Payload::FmtChunk(Fmt(1, 16)))
                        .ChunkWithSize("data", 1000, samples, false)
                        .Bytes()},
        {"truncated.wav", Wave(Fmt(1, 24), samples).substr(0, 40)},
    };
}

}  // namespace

int main(int argc, char** argv) {
    if (argc != 2) {
        std::fprintf(stderr, "usage: %s FOLDER\n", argv[0]);
        return 2;
    }
    for (const auto& [name, bytes] : Seeds()) {
        const std::string path = std::string(argv[1]) + "/" + name;
        FILE* file = std::fopen(path.c_str(), "wb");
        if (!file || std::fwrite(bytes.data(), 1, bytes.size(), file) != bytes.size() || std::fclose(file) != 0) {
            std::fprintf(stderr, "cannot write %s\n", path.c_str());
            return 1;
        }
    }
    return 0;
}
