// AIFF and AIFF-C: COMM and SSND, compression types, byte order of the samples.
#include "AudioFileWriter.h"
#include "Bytes.h"
#include "ChunkPayloads.h"
#include "ReaderTest.h"

namespace {

using Orlo::OrloStream;

Payload::Comm Comm(const std::string& compression = "", uint16_t bits = 16, uint16_t channels = 2) {
    Payload::Comm comm;
    comm.channels = channels;
    comm.frames = 1000;
    comm.bits = bits;
    comm.rate = 44100.0;
    comm.compression = compression;
    return comm;
}

// COMM's count of 1000 frames over an SSND of 16 bytes.
std::string Write(AudioFileWriter writer, const Payload::Comm& comm) {
    return writer.Chunk("FVER", Bytes::BE32(0xA2805140))
        .Chunk("COMM", Payload::CommChunk(comm))
        .Chunk("SSND", Payload::SsndChunk(0, std::string(16, '\0')))
        .Bytes();
}
std::string Aifc(const Payload::Comm& comm) { return Write(AudioFileWriter::Aifc(), comm); }
std::string Aiff(const Payload::Comm& comm) { return Write(AudioFileWriter::Aiff(), comm); }

// Each row: a file and what the stream says of it.
struct AiffRow {
    const char* name;
    std::string bytes;
    const char* error;  // null when the stream is good
    uint16_t bits;
    bool floating, dataWrongEndian;
};
void PrintTo(const AiffRow& row, std::ostream* os) { *os << row.name; }

class AiffStream : public ReaderFixture, public ::testing::WithParamInterface<AiffRow> {};

TEST_P(AiffStream, DecidesWidthAndByteOrderFromTheCompressionType) {
    const AiffRow& row = GetParam();
    auto stream = Open(row.bytes);
    if (row.error) {
        EXPECT_STREQ(stream->GetError(), row.error);
        return;
    }
    ASSERT_EQ(stream->GetError(), nullptr);
    EXPECT_EQ(stream->GetBitsPerSample(), row.bits);
    EXPECT_EQ(stream->GetIsDataFloatingPoint(), row.floating);
    EXPECT_EQ(stream->GetIsDataWrongEndian(), row.dataWrongEndian);
    EXPECT_TRUE(stream->IsFileWrongEndian()) << "chunk integers stay big-endian";
    EXPECT_EQ(stream->GetSampleCount(), 1000u) << "COMM's count stands, whatever SSND holds";
}

const char* const kNotSupported = "Compression type not supported";
const char* const kSsndBeforeComm = "Malformed AIFF file with 'SSND' before 'COMM'";
// The first 12 bytes of a COMM: the walk reads on into what follows it.
const std::string kComm12 = Payload::CommChunk(Comm()).substr(0, 12);

INSTANTIATE_TEST_SUITE_P(
    Rows, AiffStream,
    ::testing::Values(
        // An AIFF form type reads a compression type too.
        AiffRow{"AiffIn24", Aiff(Comm("in24")), nullptr, 24, false, true},
        AiffRow{"in16", Aifc(Comm("in16", 24)), nullptr, 16, false, true},
        AiffRow{"in24", Aifc(Comm("in24", 16)), nullptr, 24, false, true},
        AiffRow{"in32", Aifc(Comm("in32", 16)), nullptr, 32, false, true},
        AiffRow{"fl32", Aifc(Comm("fl32", 16)), nullptr, 32, true, true},
        AiffRow{"fl64", Aifc(Comm("fl64", 64)), "64-bit floating point format not yet supported for AIFC files.", 0,
                false, false},
        AiffRow{"SOWT", Aifc(Comm("SOWT")), kNotSupported, 0, false, false},
        AiffRow{"ulaw", Aifc(Comm("ulaw")), kNotSupported, 0, false, false},
        AiffRow{"NONE8", Aifc(Comm("NONE", 8)), "Only 16, 24, and 32-bit audio files are supported", 0, false, false},
        AiffRow{"NoChannels", Aifc(Comm("", 16, 0)), "Audio files without channels are not supported", 0, false, false},
        AiffRow{"SsndBeforeComm",
                AudioFileWriter::Aiff()
                    .Chunk("SSND", Payload::SsndChunk(0, ""))
                    .Chunk("COMM", Payload::CommChunk(Comm()))
                    .Bytes(),
                kSsndBeforeComm, 0, false, false},
        // A short COMM takes the four bytes after its 18th as a compression
        // type: garbage there is an unknown type.
        AiffRow{"ShortCommBeforeGarbage",
                AudioFileWriter::Aiff()
                    .Chunk("COMM", kComm12)
                    .Chunk("SSND", Payload::SsndChunk(0, std::string(8, 'x')))
                    .Bytes(),
                kNotSupported, 0, false, false},
        // A next chunk whose size ends in "NO" and whose payload starts "NE"
        // reads as "NONE": the short COMM is then refused, and SSND has no
        // COMM before it.
        AiffRow{"ShortCommReadingNONE",
                AudioFileWriter::Aiff()
                    .Chunk("COMM", kComm12)
                    .Chunk("JUNK", "NE" + std::string(0x4E4F - 2, '\0'))
                    .Chunk("SSND", Payload::SsndChunk(0, ""))
                    .Bytes(),
                kSsndBeforeComm, 0, false, false}),
    [](const auto& info) { return std::string(info.param.name); });

TEST_F(AiffStream, ShortSsndIsSkippedAndLeavesNoStart) {
    auto stream =
        Open(AudioFileWriter::Aiff().Chunk("COMM", Payload::CommChunk(Comm())).Chunk("SSND", Bytes::BE32(0)).Bytes());
    ASSERT_EQ(stream->GetError(), nullptr);
    EXPECT_FALSE(stream->HasChunk(OrloStream::SSND_CHUNK));
    EXPECT_THROW(stream->GetStartPosition(), std::logic_error);
}

}  // namespace
