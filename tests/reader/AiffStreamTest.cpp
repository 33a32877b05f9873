// AIFF and AIFF-C: COMM and SSND, compression types, byte order of the samples.
#include "AudioFileWriter.h"
#include "Bytes.h"
#include "ChunkPayloads.h"
#include "ReaderTest.h"
#include "reader/COMMChunk.h"

namespace {

using Orlo::OrloStream;

Payload::Comm Comm(const std::string& compression = "", uint16_t bits = 16) {
    Payload::Comm comm;
    comm.channels = 2;
    comm.frames = 1000;
    comm.bits = bits;
    comm.rate = 44100.0;
    comm.compression = compression;
    return comm;
}

std::string Aifc(const Payload::Comm& comm) {
    return AudioFileWriter::Aifc()
        .Chunk("FVER", Bytes::BE32(0xA2805140))
        .Chunk("COMM", Payload::CommChunk(comm))
        .Chunk("SSND", Payload::SsndChunk(0, std::string(16, '\0')))
        .Bytes();
}

TEST_F(ReaderTest, PlainAiffReadsItsFormatAndSampleStart) {
    const std::string bytes = AudioFileWriter::Aiff()
                                  .Chunk("COMM", Payload::CommChunk(Comm()))
                                  .Chunk("SSND", Payload::SsndChunk(8, std::string(40, '\0')))
                                  .Bytes();
    auto stream = Open(bytes);
    ASSERT_EQ(stream->GetError(), nullptr);
    EXPECT_TRUE(stream->IsFileWrongEndian());
    EXPECT_TRUE(stream->GetIsDataWrongEndian()) << "big-endian samples on a little-endian host";
    EXPECT_EQ(stream->GetChunk<Chunks::COMM::COMMChunk>()->GetCompressionType(), "");
    EXPECT_EQ(stream->GetChannelCount(), 2);
    EXPECT_EQ(stream->GetBitsPerSample(), 16);
    EXPECT_EQ(stream->GetSampleRate(), 44100.0);
    EXPECT_EQ(stream->GetSampleSize(), 2);
    // COMM's count stands, whatever SSND holds.
    EXPECT_EQ(stream->GetSampleCount(), 1000u);
    // FORM header 12, COMM 8 + 18, SSND header 8; then offset and block size
    // (8) and an offset of 8 more.
    EXPECT_EQ(stream->GetStartPosition(), 12 + 26 + 8 + 8 + 8);
}

// Each row: compression type, the bits field, and what the stream says.
struct TypeRow {
    const char* type;
    uint16_t bitsField;
    const char* error;  // null when the stream is good
    uint16_t bits;
    bool floating;
    bool dataWrongEndian;
};

class CompressionTypeTest : public ReaderTest, public ::testing::WithParamInterface<TypeRow> {};

TEST_P(CompressionTypeTest, DecidesWidthAndByteOrder) {
    const TypeRow& row = GetParam();
    auto stream = Open(Aifc(Comm(row.type, row.bitsField)));
    if (row.error) {
        EXPECT_STREQ(stream->GetError(), row.error);
        return;
    }
    ASSERT_EQ(stream->GetError(), nullptr);
    EXPECT_EQ(stream->GetBitsPerSample(), row.bits);
    EXPECT_EQ(stream->GetIsDataFloatingPoint(), row.floating);
    EXPECT_EQ(stream->GetIsDataWrongEndian(), row.dataWrongEndian);
    EXPECT_TRUE(stream->IsFileWrongEndian()) << "chunk integers stay big-endian";
}

const char* const kNotSupported = "Compression type not supported";

INSTANTIATE_TEST_SUITE_P(
    Types, CompressionTypeTest,
    ::testing::Values(TypeRow{"NONE", 24, nullptr, 24, false, true}, TypeRow{"sowt", 16, nullptr, 16, false, false},
                      TypeRow{"in16", 24, nullptr, 16, false, true}, TypeRow{"in24", 16, nullptr, 24, false, true},
                      TypeRow{"in32", 16, nullptr, 32, false, true}, TypeRow{"fl32", 16, nullptr, 32, true, true},
                      TypeRow{"fl64", 64, "64-bit floating point format not yet supported for AIFC files.", 0, false,
                              false},
                      TypeRow{"SOWT", 16, kNotSupported, 0, false, false},
                      TypeRow{"ulaw", 16, kNotSupported, 0, false, false},
                      TypeRow{"NONE", 8, "Only 16, 24, and 32-bit audio files are supported", 0, false, false}));

TEST_F(ReaderTest, AiffFormTypeReadsACompressionTypeToo) {
    auto stream = Open(AudioFileWriter::Aiff()
                           .Chunk("COMM", Payload::CommChunk(Comm("in24")))
                           .Chunk("SSND", Payload::SsndChunk(0, ""))
                           .Bytes());
    ASSERT_EQ(stream->GetError(), nullptr);
    EXPECT_EQ(stream->GetBitsPerSample(), 24);
}

TEST_F(ReaderTest, SsndBeforeCommFails) {
    const std::string bytes = AudioFileWriter::Aiff()
                                  .Chunk("SSND", Payload::SsndChunk(0, ""))
                                  .Chunk("COMM", Payload::CommChunk(Comm()))
                                  .Bytes();
    EXPECT_EQ(ErrorOf(bytes), "Malformed AIFF file with 'SSND' before 'COMM'");
}

// A COMM under 18 bytes is read on into what follows: the four bytes after its
// 18th are taken as a compression type.
TEST_F(ReaderTest, ShortCommReadsItsTypeFromTheNextChunk) {
    const std::string comm12 = Payload::CommChunk(Comm()).substr(0, 12);
    // Garbage there is an unknown type.
    EXPECT_EQ(ErrorOf(AudioFileWriter::Aiff()
                          .Chunk("COMM", comm12)
                          .Chunk("SSND", Payload::SsndChunk(0, std::string(8, 'x')))
                          .Bytes()),
              kNotSupported);
    // A next chunk whose size ends in "NO" and whose payload starts "NE" reads
    // as "NONE": the short COMM is then refused, and SSND has no COMM before it.
    const std::string junk = "NE" + std::string(0x4E4F - 2, '\0');
    EXPECT_EQ(ErrorOf(AudioFileWriter::Aiff()
                          .Chunk("COMM", comm12)
                          .Chunk("JUNK", junk)
                          .Chunk("SSND", Payload::SsndChunk(0, ""))
                          .Bytes()),
              "Malformed AIFF file with 'SSND' before 'COMM'");
}

TEST_F(ReaderTest, ShortSsndIsSkippedAndLeavesNoStart) {
    auto stream =
        Open(AudioFileWriter::Aiff().Chunk("COMM", Payload::CommChunk(Comm())).Chunk("SSND", Bytes::BE32(0)).Bytes());
    ASSERT_EQ(stream->GetError(), nullptr);
    EXPECT_FALSE(stream->HasChunk(OrloStream::SSND_CHUNK));
    EXPECT_THROW(stream->GetStartPosition(), std::logic_error);
}

TEST_F(ReaderTest, ZeroRateBytesGiveZeroRate) {
    Payload::Comm comm = Comm();
    comm.rate = 0.0;
    auto stream = Open(Aifc(comm));
    ASSERT_EQ(stream->GetError(), nullptr);
    EXPECT_EQ(stream->GetSampleRate(), 0.0);
}

TEST_F(ReaderTest, AiffWithoutChannelsFails) {
    Payload::Comm comm = Comm();
    comm.channels = 0;
    EXPECT_EQ(ErrorOf(Aifc(comm)), "Audio files without channels are not supported");
}

}  // namespace
