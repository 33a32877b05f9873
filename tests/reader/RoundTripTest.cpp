// Files of every supported format, width and a few channel counts, written by
// the test writer and read back: the stream must find every sample where the
// writer put it.
#include <tuple>

#include "AudioFileWriter.h"
#include "Bytes.h"
#include "ChunkPayloads.h"
#include "ReaderTest.h"

namespace {

enum class Container { Wave, WaveExtensible, RF64, BroadcastWave, Aiff, Aifc };

struct Format {
    const char* name;
    Container container;
    uint16_t bits;
    bool floating;
    const char* compression;  // AIFF-C only
    bool dataWrongEndian;
};

const Format kFormats[] = {
    {"Wave16", Container::Wave, 16, false, "", false},
    {"Wave24", Container::Wave, 24, false, "", false},
    {"Wave32", Container::Wave, 32, false, "", false},
    {"WaveFloat", Container::Wave, 32, true, "", false},
    {"Extensible24", Container::WaveExtensible, 24, false, "", false},
    {"ExtensibleFloat", Container::WaveExtensible, 32, true, "", false},
    {"RF64_24", Container::RF64, 24, false, "", false},
    {"RF64Float", Container::RF64, 32, true, "", false},
    {"BroadcastWave24", Container::BroadcastWave, 24, false, "", false},
    {"Aiff16", Container::Aiff, 16, false, "", true},
    {"Aiff24", Container::Aiff, 24, false, "", true},
    {"Aiff32", Container::Aiff, 32, false, "", true},
    {"AifcNone24", Container::Aifc, 24, false, "NONE", true},
    {"AifcSowt16", Container::Aifc, 16, false, "sowt", false},
    {"AifcSowt24", Container::Aifc, 24, false, "sowt", false},
    {"AifcIn16", Container::Aifc, 16, false, "in16", true},
    {"AifcIn24", Container::Aifc, 24, false, "in24", true},
    {"AifcIn32", Container::Aifc, 32, false, "in32", true},
    {"AifcFl32", Container::Aifc, 32, true, "fl32", true},
};

constexpr uint32_t kFrames = 37;
constexpr uint32_t kRate = 96000;

// Every sample byte tells its frame, so a wrong start or frame size shows.
std::string Samples(uint16_t channels, uint16_t bytes) {
    std::string out;
    for (uint32_t frame = 0; frame < kFrames; ++frame)
        out += std::string(size_t{channels} * bytes, static_cast<char>(frame + 1));
    return out;
}

std::string Write(const Format& format, uint16_t channels) {
    const std::string samples = Samples(channels, format.bits / 8);
    if (format.container == Container::Aiff || format.container == Container::Aifc) {
        Payload::Comm comm;
        comm.channels = channels;
        comm.frames = kFrames;
        comm.bits = format.bits;
        comm.rate = kRate;
        comm.compression = format.compression;
        auto writer = format.container == Container::Aiff ? AudioFileWriter::Aiff() : AudioFileWriter::Aifc();
        return writer.Chunk("COMM", Payload::CommChunk(comm)).Chunk("SSND", Payload::SsndChunk(4, samples)).Bytes();
    }
    Payload::Fmt fmt;
    fmt.channels = channels;
    fmt.rate = kRate;
    fmt.bits = format.bits;
    fmt.code = format.floating ? 3 : 1;
    if (format.container == Container::WaveExtensible) {
        fmt.subFormat = fmt.code;
        fmt.code = 0xFFFE;
    }
    if (format.container == Container::RF64) {
        return AudioFileWriter::RF64()
            .Chunk("ds64", Payload::Ds64Chunk(0, samples.size(), kFrames))
            .Chunk("fmt ", Payload::FmtChunk(fmt))
            .ChunkWithSize("data", 0xFFFFFFFF, samples, false)
            .Bytes();
    }
    auto writer = AudioFileWriter::Wave();
    if (format.container == Container::BroadcastWave) writer.Chunk("bext", Payload::BextChunk(Payload::Bext()));
    return writer.Chunk("fmt ", Payload::FmtChunk(fmt)).Chunk("data", samples).Bytes();
}

using SampleLayout = ReaderFixture;

TEST_F(SampleLayout, EveryFormatReadsBackAsWritten) {
    for (const Format& format : kFormats) {
        for (uint16_t channels : {1, 2, 6}) {
            SCOPED_TRACE(std::string(format.name) + " × " + std::to_string(channels));
            const std::string bytes = Write(format, channels);
            auto stream = Open(bytes);
            ASSERT_EQ(stream->GetError(), nullptr);
            const uint16_t sampleSize = format.bits / 8;
            // Channels, bits, floating, rate, frames, sample size, data order, RF64, file order.
            EXPECT_EQ(
                std::make_tuple(stream->GetChannelCount(), stream->GetBitsPerSample(), stream->GetIsDataFloatingPoint(),
                                stream->GetSampleRate(), stream->GetSampleCount(), stream->GetSampleSize(),
                                stream->GetIsDataWrongEndian(), stream->IsRF64(), stream->IsFileWrongEndian()),
                std::make_tuple(channels, format.bits, format.floating, kRate, kFrames, sampleSize,
                                format.dataWrongEndian, format.container == Container::RF64,
                                format.container >= Container::Aiff));
            EXPECT_EQ(stream->GetBytesRemaining(), -1) << "the file is closed after construction";
            for (uint32_t frame : {0u, 1u, kFrames - 1}) {
                const int64_t at = stream->GetSamplePosition(frame);
                ASSERT_LE(at + size_t{channels} * sampleSize, bytes.size());
                EXPECT_EQ(bytes.substr(at, size_t{channels} * sampleSize),
                          std::string(size_t{channels} * sampleSize, static_cast<char>(frame + 1)))
                    << "frame " << frame;
            }
        }
    }
}

}  // namespace
