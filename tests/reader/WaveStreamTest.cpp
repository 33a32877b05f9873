// The chunk walk over RIFF and RF64 files: failures, sizes that lie, RF64 sizes.
#include <unistd.h>

#include "AudioFileWriter.h"
#include "Bytes.h"
#include "ChunkPayloads.h"
#include "ReaderTest.h"
#include "TempFile.h"
#include "reader/DATAChunk.h"
#include "reader/FMTChunk.h"

namespace {

using Orlo::OrloStream;
using Lines = std::vector<std::pair<uint32_t, std::string>>;

std::string Fmt(uint16_t channels = 2, uint16_t bits = 24, uint16_t code = 1) {
    Payload::Fmt fmt;
    fmt.channels = channels;
    fmt.bits = bits;
    fmt.code = code;
    return Payload::FmtChunk(fmt);
}

std::string Extensible(uint16_t extensionSize, uint16_t subFormat, uint16_t bits = 24) {
    Payload::Fmt fmt;
    fmt.code = 0xFFFE;
    fmt.bits = bits;
    fmt.extensionSize = extensionSize;
    fmt.subFormat = subFormat;
    return Payload::FmtChunk(fmt);
}

std::string Samples(size_t count) { return std::string(count, '\x5A'); }

// 48 kHz, 24-bit stereo, 10 frames: the canonical 44-byte header, then 60 bytes.
std::string PlainWave() { return AudioFileWriter::Wave().Chunk("fmt ", Fmt()).Chunk("data", Samples(60)).Bytes(); }

struct FailureRow {
    const char* name;
    std::string bytes;
    const char* error;
};

class WaveFailureTest : public ReaderTest, public ::testing::WithParamInterface<FailureRow> {};

TEST_P(WaveFailureTest, EndsInItsErrorText) { EXPECT_EQ(ErrorOf(GetParam().bytes), GetParam().error); }

const char* const kUnknown = "Unknown C++ exception";
const char* const kDataBeforeFmt = "Malformed WAVE file with 'DATA' before 'fmt '";

INSTANTIATE_TEST_SUITE_P(
    Rows, WaveFailureTest,
    ::testing::Values(
        FailureRow{"EmptyFile", "", kUnknown}, FailureRow{"ThreeBytes", "RIF", kUnknown},
        FailureRow{"UnknownOuterId", "JUNK" + Bytes::LE32(4) + "WAVE",
                   "Input does not appear to be either AIFF or WAVE"},
        FailureRow{"LowerCaseOuterId", "riff" + Bytes::LE32(4) + "WAVE",
                   "Input does not appear to be either AIFF or WAVE"},
        FailureRow{"UnknownFormType", AudioFileWriter(AudioFileWriter::Frame::RIFF, "AVI ").Bytes(),
                   "Input is not a WAVE, AIFF, or AIFF-C file"},
        // Under 8 bytes the outer header is not consumed: the form type is
        // read at offset 0 and is "RIFF".
        FailureRow{"SixBytes", "RIFF\x04\x00", "Input is not a WAVE, AIFF, or AIFF-C file"},
        FailureRow{"OuterHeaderOnly", "RIFF" + Bytes::LE32(0), kUnknown},
        FailureRow{"DataBeforeFmt", AudioFileWriter::Wave().Chunk("data", Samples(6)).Chunk("fmt ", Fmt()).Bytes(),
                   kDataBeforeFmt},
        FailureRow{"CompressionCode2", AudioFileWriter::Wave().Chunk("fmt ", Fmt(2, 16, 2)).Chunk("data", "").Bytes(),
                   kDataBeforeFmt},
        FailureRow{"ExtensionSize0", AudioFileWriter::Wave().Chunk("fmt ", Extensible(0, 1)).Chunk("data", "").Bytes(),
                   kDataBeforeFmt},
        FailureRow{"ExtensibleSubFormat2",
                   AudioFileWriter::Wave().Chunk("fmt ", Extensible(22, 2)).Chunk("data", "").Bytes(), kDataBeforeFmt},
        FailureRow{"UpperCaseFmt", AudioFileWriter::Wave().Chunk("FMT ", Fmt()).Chunk("data", "").Bytes(),
                   kDataBeforeFmt},
        FailureRow{"NoFormatChunk", AudioFileWriter::Wave().Chunk("JUNK", Samples(10)).Bytes(), kUnknown},
        FailureRow{"EightBits", AudioFileWriter::Wave().Chunk("fmt ", Fmt(1, 8)).Chunk("data", Samples(4)).Bytes(),
                   "Only 16, 24, and 32-bit audio files are supported"},
        FailureRow{"FloatOf24Bits", AudioFileWriter::Wave().Chunk("fmt ", Fmt(1, 24, 3)).Chunk("data", "").Bytes(),
                   "Only 32-bit is supported when sample format is floating point"},
        FailureRow{"FmtCutOff", AudioFileWriter::Wave().Raw("fmt " + Bytes::LE32(16) + Fmt().substr(0, 10)).Bytes(),
                   kUnknown},
        FailureRow{"BextCutOff",
                   AudioFileWriter::Wave().Chunk("fmt ", Fmt()).Raw("bext" + Bytes::LE32(602) + Samples(300)).Bytes(),
                   kUnknown},
        // A writer that leaves out the pad byte of an odd chunk throws the walk
        // one byte off, and what follows is no longer found.
        FailureRow{"MissingPadByte",
                   AudioFileWriter::Wave().ChunkWithSize("JUNK", 3, "abc", false).Chunk("fmt ", Fmt()).Bytes(),
                   kUnknown},
        // Frames of no channels or of no bits cannot be counted.
        FailureRow{"ZeroChannelsWithData",
                   AudioFileWriter::Wave().Chunk("fmt ", Fmt(0, 16)).Chunk("data", Samples(8)).Bytes(),
                   "Audio files without channels are not supported"},
        FailureRow{"ZeroChannelsWithoutData", AudioFileWriter::Wave().Chunk("fmt ", Fmt(0, 16)).Bytes(),
                   "Audio files without channels are not supported"},
        FailureRow{"ZeroBitsWithData",
                   AudioFileWriter::Wave().Chunk("fmt ", Fmt(2, 0)).Chunk("data", Samples(8)).Bytes(),
                   "Only 16, 24, and 32-bit audio files are supported"}),
    [](const auto& info) { return std::string(info.param.name); });

TEST_F(ReaderTest, MissingFileCannotBeOpened) {
    OrloStream stream("/nonexistent/orlo/take.wav", 255);
    EXPECT_STREQ(stream.GetError(), "File could not be opened");
}

TEST_F(ReaderTest, NoChunksAskedForFails) {
    TempFile file(PlainWave());
    OrloStream stream(file.Path().c_str(), 0);
    EXPECT_STREQ(stream.GetError(), "No chunks specified for reading!");
}

TEST_F(ReaderTest, PlainWaveAnswersEveryAccessor) {
    auto stream = Open(PlainWave());
    ASSERT_EQ(stream->GetError(), nullptr);
    EXPECT_FALSE(stream->IsFileWrongEndian());
    EXPECT_FALSE(stream->IsRF64());
    EXPECT_TRUE(stream->HasChunk(OrloStream::FMT_CHUNK | OrloStream::DATA_CHUNK));
    EXPECT_FALSE(stream->HasChunk(OrloStream::COMM_CHUNK));
    EXPECT_EQ(stream->GetChannelCount(), 2);
    EXPECT_EQ(stream->GetBitsPerSample(), 24);
    EXPECT_EQ(stream->GetSampleRate(), 48000.0);
    EXPECT_FALSE(stream->GetIsDataFloatingPoint());
    EXPECT_FALSE(stream->GetIsDataWrongEndian());
    EXPECT_EQ(stream->GetSampleSize(), 3);
    EXPECT_EQ(stream->GetSampleCount(), 10u);
    EXPECT_EQ(stream->GetStartPosition(), 44);
    EXPECT_EQ(stream->GetSamplePosition(4), 44 + 3 * 4 * 2);
    EXPECT_EQ(stream->GetBytesRemaining(), -1) << "the file is closed after construction";
}

TEST_F(ReaderTest, FormatWithoutDataIsGoodUntilAskedForSamples) {
    auto stream = Open(AudioFileWriter::Wave().Chunk("fmt ", Fmt()).Bytes());
    ASSERT_EQ(stream->GetError(), nullptr);
    EXPECT_EQ(stream->GetChannelCount(), 2);
    EXPECT_THROW(stream->GetSampleCount(), std::logic_error);
    EXPECT_THROW(stream->GetStartPosition(), std::logic_error);
    EXPECT_THROW(stream->GetSampleSize(), std::logic_error);
}

// Each row: the data chunk's size field, the payload bytes in the file, and
// what the stream makes of it. 16-bit mono, so a frame is 2 bytes.
struct DataSizeRow {
    const char* name;
    uint32_t sizeField;
    size_t payload;
    bool pad;
    uint64_t sampleCount;
};

class DataSizeTest : public ReaderTest, public ::testing::WithParamInterface<DataSizeRow> {};

TEST_P(DataSizeTest, CountsTheSamplesThatAreThere) {
    const DataSizeRow& row = GetParam();
    auto stream = Open(AudioFileWriter::Wave()
                           .Chunk("fmt ", Fmt(1, 16))
                           .ChunkWithSize("data", row.sizeField, Samples(row.payload), row.pad)
                           .Bytes());
    ASSERT_EQ(stream->GetError(), nullptr);
    EXPECT_EQ(stream->GetSampleCount(), row.sampleCount);
}

INSTANTIATE_TEST_SUITE_P(Rows, DataSizeTest,
                         ::testing::Values(DataSizeRow{"Exact", 20, 20, false, 10},
                                           // The pad byte of an odd chunk counts as data.
                                           DataSizeRow{"OddWithPad", 7, 7, true, 4},
                                           DataSizeRow{"OddWithoutPad", 7, 7, false, 3},
                                           DataSizeRow{"LargerThanFile", 1000, 20, false, 10},
                                           DataSizeRow{"FileCutMidFrame", 20, 13, false, 6},
                                           // 0xFFFFFFFF rounds up to 0.
                                           DataSizeRow{"AllOnes", 0xFFFFFFFF, 0, false, 0}),
                         [](const auto& info) { return std::string(info.param.name); });

// A data size of 0 leaves the walk at the first sample byte: what the samples
// hold is read as chunks. Here they hold a umid chunk.
TEST_F(ReaderTest, ZeroSizedDataIsWalkedAsChunks) {
    const std::string inner = "umid" + Bytes::LE32(24) + Samples(24);
    for (uint32_t size : {0u, 0xFFFFFFFFu}) {
        auto stream =
            Open(AudioFileWriter::Wave().Chunk("fmt ", Fmt()).ChunkWithSize("data", size, inner, false).Bytes());
        ASSERT_EQ(stream->GetError(), nullptr);
        EXPECT_EQ(stream->GetSampleCount(), 0u);
        EXPECT_TRUE(stream->HasChunk(OrloStream::UMID_CHUNK)) << size;
    }
}

// Digital silence walked as chunks (a data size of 0) is a run of empty,
// nameless chunks, 8 bytes each, passed over in bulk. A chunk behind the run
// is found exactly when it stands on the 8-byte grid of the run.
TEST_F(ReaderTest, SilenceWalkedAsChunksEndsWhereTheGridDoes) {
    const struct {
        size_t silence;
        std::string tail;
        bool umidFound;
    } rows[] = {{8, "umid" + Bytes::LE32(24) + Samples(24), true},
                {70000, "umid" + Bytes::LE32(24) + Samples(24), true},
                {(1 << 16) * 2, "umid" + Bytes::LE32(24) + Samples(24), true},
                {70004, "umid" + Bytes::LE32(24) + Samples(24), false},
                {70000,
                 "\x01"
                 "abc" +
                     Bytes::LE32(0) + "umid" + Bytes::LE32(24) + Samples(24),
                 true},
                {70000, "xyz", false},
                {70000, "", false}};
    for (const auto& row : rows) {
        auto stream = Open(AudioFileWriter::Wave()
                               .Chunk("fmt ", Fmt())
                               .ChunkWithSize("data", 0, std::string(row.silence, '\0') + row.tail, false)
                               .Bytes());
        ASSERT_EQ(stream->GetError(), nullptr) << row.silence;
        EXPECT_EQ(stream->HasChunk(OrloStream::UMID_CHUNK), row.umidFound) << row.silence << " " << row.tail.size();
    }
}

TEST_F(ReaderTest, TrailingBytesShorterThanAHeaderAreIgnored) {
    for (size_t tail = 1; tail < 8; ++tail) {
        auto stream = Open(PlainWave() + Samples(tail));
        EXPECT_EQ(stream->GetError(), nullptr) << tail;
    }
}

TEST_F(ReaderTest, LaterChunkOfTheSameTypeWins) {
    auto stream = Open(
        AudioFileWriter::Wave().Chunk("fmt ", Fmt(2, 24)).Chunk("fmt ", Fmt(1, 16)).Chunk("data", Samples(8)).Bytes());
    ASSERT_EQ(stream->GetError(), nullptr);
    EXPECT_EQ(stream->GetChannelCount(), 1);
    EXPECT_EQ(stream->GetSampleCount(), 4u);
}

TEST_F(ReaderTest, ChunksAfterDataAreRead) {
    auto stream = Open(
        AudioFileWriter::Wave().Chunk("fmt ", Fmt()).Chunk("data", Samples(61)).Chunk("umid", Samples(24)).Bytes());
    ASSERT_EQ(stream->GetError(), nullptr);
    EXPECT_TRUE(stream->HasChunk(OrloStream::UMID_CHUNK));
}

// Format codes and extension sizes: which fmt chunks are taken and what they say.
struct FmtRow {
    const char* name;
    std::string payload;
    bool accepted;
    bool pcm;
    bool floating;
};

class FmtTest : public ReaderTest, public ::testing::WithParamInterface<FmtRow> {};

TEST_P(FmtTest, AcceptsTheCodesThatNameLinearSamples) {
    const FmtRow& row = GetParam();
    auto stream = Open(AudioFileWriter::Wave().Chunk("fmt ", row.payload).Bytes());
    ASSERT_EQ(stream->HasChunk(OrloStream::FMT_CHUNK), row.accepted);
    const auto fmt = stream->GetChunk<Chunks::FMT::FMTChunk>();
    EXPECT_EQ(fmt->IsPCM(), row.pcm);
    EXPECT_EQ(fmt->IsFloatingPoint(), row.floating);
}

INSTANTIATE_TEST_SUITE_P(Rows, FmtTest,
                         ::testing::Values(FmtRow{"PCM", Fmt(2, 24, 1), true, true, false},
                                           FmtRow{"Float", Fmt(2, 32, 3), true, false, true},
                                           FmtRow{"ExtensiblePCM", Extensible(22, 1), true, true, false},
                                           FmtRow{"ExtensibleFloat", Extensible(22, 3, 32), true, false, true},
                                           FmtRow{"ExtensibleOther", Extensible(22, 2), false, false, false},
                                           FmtRow{"ExtensionOf0", Extensible(0, 1), false, false, false},
                                           // 1 to 7 extension bytes name no sub-format.
                                           FmtRow{"ExtensionOf4", Extensible(4, 1), true, false, false},
                                           FmtRow{"ADPCM", Fmt(2, 4, 2), false, false, false}),
                         [](const auto& info) { return std::string(info.param.name); });

// A chunk smaller than the extensible fixed part sends the walk beyond the
// end: nothing after it is found.
TEST_F(ReaderTest, ShortExtensibleFmtEndsTheWalk) {
    std::string payload = Extensible(22, 1).substr(0, 16);
    auto stream = Open(AudioFileWriter::Wave()
                           .ChunkWithSize("fmt ", 16, payload + Bytes::LE16(22) + Samples(6) + Bytes::LE16(1), false)
                           .Chunk("umid", Samples(24))
                           .Bytes());
    EXPECT_EQ(stream->GetError(), nullptr);
    EXPECT_FALSE(stream->HasChunk(OrloStream::UMID_CHUNK));
}

TEST_F(ReaderTest, FormFrameWithWaveChunksReadsThemBigEndian) {
    std::string fmt =
        Bytes::BE16(1) + Bytes::BE16(1) + Bytes::BE32(44100) + Bytes::BE32(88200) + Bytes::BE16(2) + Bytes::BE16(16);
    auto stream = Open(
        AudioFileWriter(AudioFileWriter::Frame::FORM, "WAVE").Chunk("fmt ", fmt).Chunk("data", Samples(8)).Bytes());
    ASSERT_EQ(stream->GetError(), nullptr);
    EXPECT_TRUE(stream->IsFileWrongEndian());
    EXPECT_TRUE(stream->GetIsDataWrongEndian());
    EXPECT_EQ(stream->GetSampleRate(), 44100.0);
    EXPECT_EQ(stream->GetSampleCount(), 4u);
}

class RF64Test : public ReaderTest {
protected:
    // Stereo 24-bit: 6-byte frames.
    AudioFileWriter WithDs64(uint64_t dataSize, uint64_t sampleCount) {
        auto writer = AudioFileWriter::RF64();
        writer.Chunk("ds64", Payload::Ds64Chunk(0x123456789ull, dataSize, sampleCount)).Chunk("fmt ", Fmt());
        return writer;
    }
};

TEST_F(RF64Test, DataSizeComesFromDs64) {
    // The data chunk's own field says 0xFFFFFFFF; ds64 says 60, and the umid
    // behind the samples is found only if the walk seeks by ds64's size.
    auto stream =
        Open(WithDs64(60, 10).ChunkWithSize("data", 0xFFFFFFFF, Samples(60), false).Chunk("umid", Samples(24)).Bytes());
    ASSERT_EQ(stream->GetError(), nullptr);
    EXPECT_TRUE(stream->IsRF64());
    EXPECT_EQ(stream->GetSampleCount(), 10u);
    EXPECT_TRUE(stream->HasChunk(OrloStream::DS64_CHUNK | OrloStream::UMID_CHUNK));
}

TEST_F(RF64Test, AcceptedDs64IsTracedWithItsLabelsShifted) {
    Open(WithDs64(60, 10).Chunk("data", Samples(60)).Bytes());
    // RIFF size, data size, sample count and table length, each one label to
    // the left; the last placeholder has no value of its own.
    const std::pair<uint32_t, std::string> expected{
        8, "Parsed RF64(4886718345) RIFF-SIZE=[60] DATA-SIZE=[10] SAMPLES=[0] ENTRIES=[0]"};
    EXPECT_EQ(host.Lines(), Lines{expected});
}

TEST_F(RF64Test, WithoutDs64HasNoData) {
    const std::string inner = "umid" + Bytes::LE32(24) + Samples(24);
    auto stream = Open(AudioFileWriter::RF64().Chunk("fmt ", Fmt()).Chunk("data", inner).Bytes());
    ASSERT_EQ(stream->GetError(), nullptr);
    EXPECT_EQ(stream->GetSampleCount(), 0u);
    EXPECT_TRUE(stream->HasChunk(OrloStream::UMID_CHUNK)) << "the walk goes on inside the sample bytes";
}

TEST_F(RF64Test, EmptyDs64IsRefusedAtLevel1) {
    auto stream = Open(WithDs64(0, 0).Chunk("data", Samples(60)).Bytes());
    ASSERT_EQ(stream->GetError(), nullptr);
    EXPECT_FALSE(stream->HasChunk(OrloStream::DS64_CHUNK));
    EXPECT_EQ(stream->GetSampleCount(), 0u);
    ASSERT_EQ(host.Lines().size(), 1u);
    EXPECT_EQ(host.Lines()[0].first, 1u);
}

TEST_F(RF64Test, Ds64CutOffIsLoggedAndDropped) {
    auto stream = Open(AudioFileWriter::Wave()
                           .Chunk("fmt ", Fmt())
                           .Chunk("data", Samples(60))
                           .Raw("ds64" + Bytes::LE32(28) + Bytes::LE64(1))
                           .Bytes());
    EXPECT_EQ(stream->GetError(), nullptr);
    EXPECT_FALSE(stream->HasChunk(OrloStream::DS64_CHUNK));
    const std::pair<uint32_t, std::string> expected{4, "Exception Caught in DS64Chunk::InitChunkFromStream()"};
    EXPECT_EQ(host.Lines(), Lines{expected});
}

TEST_F(RF64Test, Ds64InPlainRiffHasNoEffect) {
    auto stream = Open(AudioFileWriter::Wave()
                           .Chunk("ds64", Payload::Ds64Chunk(0, 6000, 1000))
                           .Chunk("fmt ", Fmt())
                           .Chunk("data", Samples(60))
                           .Bytes());
    ASSERT_EQ(stream->GetError(), nullptr);
    EXPECT_EQ(stream->GetSampleCount(), 10u);
}

// A 5 GiB file, sparse on disk: sizes and offsets beyond 32 bits.
TEST_F(RF64Test, SizesBeyondFourGiB) {
    const uint64_t dataSize = 5ull << 30;
    const std::string head = WithDs64(dataSize, dataSize / 6).ChunkWithSize("data", 0xFFFFFFFF, "", false).Bytes();
    TempFile file(head);
    ASSERT_EQ(truncate(file.Path().c_str(), static_cast<off_t>(head.size() + dataSize)), 0);
    OrloStream stream(file.Path().c_str(), 255);
    ASSERT_EQ(stream.GetError(), nullptr);
    const uint64_t frames = dataSize / 6;
    EXPECT_EQ(stream.GetSampleCount(), frames);
    EXPECT_EQ(stream.GetSamplePosition(frames - 1), static_cast<int64_t>(head.size() + (frames - 1) * 6));
}

}  // namespace
