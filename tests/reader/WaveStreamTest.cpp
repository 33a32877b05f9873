// The chunk walk over RIFF and RF64 files: failures, sizes that lie, RF64 sizes.
#include <unistd.h>

#include "AudioFileWriter.h"
#include "Bytes.h"
#include "ChunkPayloads.h"
#include "ReaderTest.h"
#include "TempFile.h"
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
// A umid chunk laid out by hand, to stand inside other chunks' payloads.
const std::string kUmid = "umid" + Bytes::LE32(24) + Samples(24);

AudioFileWriter WaveFmt(const std::string& fmt = Fmt()) { return AudioFileWriter::Wave().Chunk("fmt ", fmt); }
// Stereo 24-bit, so 6-byte frames, behind a ds64 chunk.
AudioFileWriter RF64With(uint64_t dataSize, uint64_t sampleCount) {
    return AudioFileWriter::RF64()
        .Chunk("ds64", Payload::Ds64Chunk(0x123456789ull, dataSize, sampleCount))
        .Chunk("fmt ", Fmt());
}
// A data size of 0 leaves the walk at the first sample byte: the samples, here
// `silence` zero bytes and then `tail`, are walked as chunks.
std::string SilenceThen(size_t silence, const std::string& tail) {
    return WaveFmt().ChunkWithSize("data", 0, std::string(silence, '\0') + tail, false).Bytes();
}

struct FailureRow {
    const char* name;
    std::string bytes;
    const char* error;
};
void PrintTo(const FailureRow& row, std::ostream* os) { *os << row.name; }

class WaveFailure : public ReaderFixture, public ::testing::WithParamInterface<FailureRow> {};

TEST_P(WaveFailure, EndsInItsErrorText) { EXPECT_EQ(ErrorOf(GetParam().bytes), GetParam().error); }

const char* const kUnknown = "Unknown C++ exception";
const char* const kDataBeforeFmt = "Malformed WAVE file with 'DATA' before 'fmt '";
const char* const kNotAudio = "Input does not appear to be either AIFF or WAVE";
const char* const kNoChannels = "Audio files without channels are not supported";
const char* const kBits = "Only 16, 24, and 32-bit audio files are supported";

INSTANTIATE_TEST_SUITE_P(
    Rows, WaveFailure,
    ::testing::Values(
        FailureRow{"EmptyFile", "", kUnknown},
        FailureRow{"UnknownOuterId", "JUNK" + Bytes::LE32(4) + "WAVE", kNotAudio},
        FailureRow{"LowerCaseOuterId", "riff" + Bytes::LE32(4) + "WAVE", kNotAudio},
        FailureRow{"UnknownFormType", AudioFileWriter(AudioFileWriter::Frame::RIFF, "AVI ").Bytes(),
                   "Input is not a WAVE, AIFF, or AIFF-C file"},
        // Under 8 bytes the outer header is not consumed: the form type is
        // read at offset 0 and is "RIFF".
        FailureRow{"SixBytes", "RIFF\x04\x00", "Input is not a WAVE, AIFF, or AIFF-C file"},
        FailureRow{"OuterHeaderOnly", "RIFF" + Bytes::LE32(0), kUnknown},
        FailureRow{"DataBeforeFmt", AudioFileWriter::Wave().Chunk("data", Samples(6)).Chunk("fmt ", Fmt()).Bytes(),
                   kDataBeforeFmt},
        FailureRow{"UpperCaseFmt", AudioFileWriter::Wave().Chunk("FMT ", Fmt()).Chunk("data", "").Bytes(),
                   kDataBeforeFmt},
        FailureRow{"NoFormatChunk", AudioFileWriter::Wave().Chunk("JUNK", Samples(10)).Bytes(), kUnknown},
        FailureRow{"EightBits", WaveFmt(Fmt(1, 8)).Chunk("data", Samples(4)).Bytes(), kBits},
        FailureRow{"FloatOf24Bits", WaveFmt(Fmt(1, 24, 3)).Chunk("data", "").Bytes(),
                   "Only 32-bit is supported when sample format is floating point"},
        FailureRow{"FmtCutOff", AudioFileWriter::Wave().Raw("fmt " + Bytes::LE32(16) + Fmt().substr(0, 10)).Bytes(),
                   kUnknown},
        FailureRow{"BextCutOff", WaveFmt().Raw("bext" + Bytes::LE32(602) + Samples(300)).Bytes(), kUnknown},
        // A writer that leaves out the pad byte of an odd chunk throws the walk
        // one byte off, and what follows is no longer found.
        FailureRow{"MissingPadByte",
                   AudioFileWriter::Wave().ChunkWithSize("JUNK", 3, "abc", false).Chunk("fmt ", Fmt()).Bytes(),
                   kUnknown},
        // Frames of no channels or of no bits cannot be counted.
        FailureRow{"ZeroChannelsWithData", WaveFmt(Fmt(0, 16)).Chunk("data", Samples(8)).Bytes(), kNoChannels},
        FailureRow{"ZeroChannelsWithoutData", WaveFmt(Fmt(0, 16)).Bytes(), kNoChannels},
        FailureRow{"ZeroBitsWithData", WaveFmt(Fmt(2, 0)).Chunk("data", Samples(8)).Bytes(), kBits}),
    [](const auto& info) { return std::string(info.param.name); });

using WaveStream = ReaderFixture;
using Ds64Chunk = ReaderFixture;

TEST_F(WaveStream, FailsOnAMissingFileAndOnNoChunksAskedFor) {
    EXPECT_STREQ(OrloStream("/nonexistent/orlo/take.wav", Orlo::kAllChunks).GetError(), "File could not be opened");
    TempFile file(WaveFmt().Chunk("data", Samples(6)).Bytes());
    EXPECT_STREQ(OrloStream(file.Path().c_str(), 0).GetError(), "No chunks specified for reading!");
}

// Each row: a good file, its sample count (-1: there are no samples to ask
// for), and which of the umid and ds64 chunks the walk took.
struct WalkRow {
    const char* name;
    std::string bytes;
    int64_t samples;
    unsigned found;
};
void PrintTo(const WalkRow& row, std::ostream* os) { *os << row.name; }

class ChunkWalk : public ReaderFixture, public ::testing::WithParamInterface<WalkRow> {};

TEST_P(ChunkWalk, CountsTheSamplesAndFindsTheChunksBehind) {
    const WalkRow& row = GetParam();
    auto stream = Open(row.bytes);
    ASSERT_EQ(stream->GetError(), nullptr);
    if (row.samples < 0) {
        EXPECT_THROW(stream->GetSampleCount(), std::logic_error);
        EXPECT_THROW(stream->GetStartPosition(), std::logic_error);
    } else {
        EXPECT_EQ(stream->GetSampleCount(), static_cast<uint64_t>(row.samples));
    }
    for (unsigned chunk : {OrloStream::UMID_CHUNK, OrloStream::DS64_CHUNK})
        EXPECT_EQ(stream->HasChunk(chunk), (row.found & chunk) != 0) << chunk;
}

// A data chunk of 16-bit mono, so 2-byte frames: size field, payload bytes, pad.
std::string Mono16(uint32_t size, size_t payload, bool pad) {
    return WaveFmt(Fmt(1, 16)).ChunkWithSize("data", size, Samples(payload), pad).Bytes();
}

const unsigned kUmidFound = OrloStream::UMID_CHUNK;
const unsigned kDs64Found = OrloStream::DS64_CHUNK;

INSTANTIATE_TEST_SUITE_P(
    Rows, ChunkWalk,
    ::testing::Values(
        WalkRow{"DataExact", Mono16(20, 20, false), 10, 0},
        // The pad byte of an odd chunk counts as data.
        WalkRow{"OddDataWithPad", Mono16(7, 7, true), 4, 0}, WalkRow{"OddDataWithoutPad", Mono16(7, 7, false), 3, 0},
        WalkRow{"DataLargerThanFile", Mono16(1000, 20, false), 10, 0},
        WalkRow{"FileCutMidFrame", Mono16(20, 13, false), 6, 0},
        WalkRow{"ZeroDataSizeWalksTheSamples", SilenceThen(0, kUmid), 0, kUmidFound},
        // 0xFFFFFFFF rounds up to 0.
        WalkRow{"AllOnesDataSizeIsZero", WaveFmt().ChunkWithSize("data", 0xFFFFFFFF, kUmid, false).Bytes(), 0,
                kUmidFound},
        // Digital silence walked as chunks is a run of empty, nameless chunks,
        // 8 bytes each, passed over in bulk. A chunk behind the run is found
        // exactly when it stands on the 8-byte grid of the run.
        WalkRow{"SilenceOf8", SilenceThen(8, kUmid), 0, kUmidFound},
        WalkRow{"SilenceOf70000", SilenceThen(70000, kUmid), 0, kUmidFound},
        WalkRow{"SilenceOfTwoBlocks", SilenceThen((1 << 16) * 2, kUmid), 0, kUmidFound},
        WalkRow{"SilenceOffTheGrid", SilenceThen(70004, kUmid), 0, 0},
        WalkRow{"SilenceThenOddChunk",
                SilenceThen(70000,
                            "\x01"
                            "abc" +
                                Bytes::LE32(0) + kUmid),
                0, kUmidFound},
        WalkRow{"SilenceThenShortTail", SilenceThen(70000, "xyz"), 0, 0},
        WalkRow{"SilenceToTheEnd", SilenceThen(70000, ""), 0, 0},
        WalkRow{"TrailingBytesShorterThanAHeader", WaveFmt().Chunk("data", Samples(60)).Bytes() + Samples(7), 10, 0},
        WalkRow{"LaterFmtWins", WaveFmt(Fmt(2, 24)).Chunk("fmt ", Fmt(1, 16)).Chunk("data", Samples(8)).Bytes(), 4, 0},
        WalkRow{"ChunkAfterOddData", WaveFmt().Chunk("data", Samples(61)).Chunk("umid", Samples(24)).Bytes(), 10,
                kUmidFound},
        WalkRow{"FmtWithoutData", WaveFmt().Bytes(), -1, 0},
        // A chunk smaller than the extensible fixed part sends the walk beyond
        // the end: nothing after it is found.
        WalkRow{
            "ShortExtensibleFmtEndsTheWalk",
            AudioFileWriter::Wave()
                .ChunkWithSize("fmt ", 16,
                               Extensible(22, 1).substr(0, 16) + Bytes::LE16(22) + Samples(6) + Bytes::LE16(1), false)
                .Chunk("umid", Samples(24))
                .Bytes(),
            -1, 0},
        // ds64 says 60 where the data chunk says 0xFFFFFFFF: the umid behind
        // the samples is found only if the walk seeks by ds64's size.
        WalkRow{
            "RF64DataSizeFromDs64",
            RF64With(60, 10).ChunkWithSize("data", 0xFFFFFFFF, Samples(60), false).Chunk("umid", Samples(24)).Bytes(),
            10, kUmidFound | kDs64Found},
        WalkRow{"RF64WithoutDs64HasNoData", AudioFileWriter::RF64().Chunk("fmt ", Fmt()).Chunk("data", kUmid).Bytes(),
                0, kUmidFound},
        WalkRow{"RF64EmptyDs64IsRefused", RF64With(0, 0).Chunk("data", Samples(60)).Bytes(), 0, 0},
        WalkRow{"Ds64CutOffIsDropped",
                WaveFmt().Chunk("data", Samples(60)).Raw("ds64" + Bytes::LE32(28) + Bytes::LE64(1)).Bytes(), 10, 0},
        WalkRow{"Ds64InPlainRiffHasNoEffect",
                AudioFileWriter::Wave()
                    .Chunk("ds64", Payload::Ds64Chunk(0, 6000, 1000))
                    .Chunk("fmt ", Fmt())
                    .Chunk("data", Samples(60))
                    .Bytes(),
                10, kDs64Found}),
    [](const auto& info) { return std::string(info.param.name); });

// What the ds64 parser tells the console: its values one label to the left
// at trace level, a refusal at level 1, a cut-off chunk as an exception.
TEST_F(Ds64Chunk, IsReportedOnTheConsole) {
    const struct {
        std::string bytes;
        Lines lines;
    } rows[] = {
        {RF64With(60, 10).Chunk("data", Samples(60)).Bytes(),
         {{8, "Parsed RF64(4886718345) RIFF-SIZE=[60] DATA-SIZE=[10] SAMPLES=[0] ENTRIES=[0]"}}},
        {RF64With(0, 0).Chunk("data", Samples(60)).Bytes(),
         {{1, "Parsed RF64(4886718345) RIFF-SIZE=[0] DATA-SIZE=[0] SAMPLES=[0] ENTRIES=[0]"}}},
        {WaveFmt().Raw("ds64" + Bytes::LE32(28) + Bytes::LE64(1)).Bytes(),
         {{4, "Exception Caught in DS64Chunk::InitChunkFromStream()"}}},
    };
    for (const auto& row : rows) {
        host.ClearLines();
        Open(row.bytes);
        EXPECT_EQ(host.Lines(), row.lines);
    }
}

TEST_F(WaveStream, FormFrameWithWaveChunksReadsThemBigEndian) {
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

// Format codes and extension sizes: which fmt chunks are taken and what they say.
struct FmtRow {
    const char* name;
    std::string payload;
    bool accepted, pcm, floating;
};
void PrintTo(const FmtRow& row, std::ostream* os) { *os << row.name; }

class FmtCode : public ReaderFixture, public ::testing::WithParamInterface<FmtRow> {};

TEST_P(FmtCode, AcceptsTheCodesThatNameLinearSamples) {
    const FmtRow& row = GetParam();
    auto stream = Open(WaveFmt(row.payload).Bytes());
    ASSERT_EQ(stream->HasChunk(OrloStream::FMT_CHUNK), row.accepted);
    const auto fmt = stream->GetChunk<Chunks::FMT::FMTChunk>();
    EXPECT_EQ(fmt->IsPCM(), row.pcm);
    EXPECT_EQ(fmt->IsFloatingPoint(), row.floating);
}

INSTANTIATE_TEST_SUITE_P(Rows, FmtCode,
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

// A 5 GiB file, sparse on disk: sizes and offsets beyond 32 bits.
TEST_F(WaveStream, RF64SizesBeyondFourGiB) {
    const uint64_t dataSize = 5ull << 30;
    const std::string head = RF64With(dataSize, dataSize / 6).ChunkWithSize("data", 0xFFFFFFFF, "", false).Bytes();
    TempFile file(head);
    ASSERT_EQ(truncate(file.Path().c_str(), static_cast<off_t>(head.size() + dataSize)), 0);
    OrloStream stream(file.Path().c_str(), Orlo::kAllChunks);
    ASSERT_EQ(stream.GetError(), nullptr);
    const uint64_t frames = dataSize / 6;
    EXPECT_EQ(stream.GetSampleCount(), frames);
    EXPECT_EQ(stream.GetSamplePosition(frames - 1), static_cast<int64_t>(head.size() + (frames - 1) * 6));
}

}  // namespace
