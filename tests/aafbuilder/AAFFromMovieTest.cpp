// Whole clips of one file compared with golden dumps (ORLO_UPDATE_GOLDEN=1
// rewrites them), the start offset and tape padding of hand-made Movies, and
// the failures.
#include <filesystem>
#include <optional>

#include "AudioFileWriter.h"
#include "BuilderTest.h"
#include "ChunkPayloads.h"
#include "ExampleTake.h"
#include "GoldenDump.h"
#include "RunTool.h"
#include "aafbuilder/NewAAFFromMovie.h"

namespace {

using OrloReader::Movie;

class AAFFromMovie : public BuilderTest {
protected:
    void ExpectClip(Movie* movie, const std::string& golden, const std::string& path) {
        ASSERT_TRUE(movie);
        aaftest::Ptr<IAAFFile> file;
        ASSERT_EQ(Build(movie, file, path), TOV_OK);
        aaftest::ExpectMatchesGolden(Dump(file.get()), std::string(AAFBUILDER_GOLDEN_DIR) + "/" + golden);
    }
};

// The stereo example take: on tape, comments from bext and iXML with the TRK
// names, the start from the iXML samples since midnight. Off tape: an import
// descriptor, the tape Mob named by the tape ID, the sound roll comments.
TEST_F(AAFFromMovie, ExampleTakeOnAndOffTape) {
    auto movie = Load(ExampleTake::kFileName, ExampleTake::File());
    ExpectClip(movie.get(), "example_take_on_tape.txt", "/media/day1/12A-T03.wav");
    movie->SetIsMovieOnTape(false);
    ExpectClip(movie.get(), "example_take_off_tape.txt", "/media/day1/12A-T03.wav");
}

// A floating-point mono file named as the third of a group, with a second
// timecode track: tape slots TC1, AuxTC1 (between fillers), A1 to A3; one
// Master slot, A3. The bext chunk gives a shoot date that does not change.
TEST_F(AAFFromMovie, FloatMonoThirdTrackWithAuxiliaryTimecode) {
    Payload::Fmt fmt;
    fmt.code = 3;
    fmt.channels = 1;
    fmt.bits = 32;
    auto movie = Load("Take7_3.wav", AudioFileWriter::Wave()
                                         .Chunk("fmt ", Payload::FmtChunk(fmt))
                                         .Chunk("bext", Payload::BextChunk(Payload::Bext{}))
                                         .Chunk("data", std::string(4 * 480, '\x11'))
                                         .Bytes());
    ASSERT_TRUE(movie);
    movie->AddTrack(std::make_shared<OrloReader::Track>(OrloReader::kMediaTypeTimecode));
    ExpectClip(movie.get(), "mono_third_aux_timecode.txt", "/media/day1/Take7_3.wav");
}

// The numbers of the lines of `key` in the order of the dump.
std::vector<long long> Numbers(const std::string& dump, const std::string& key) {
    std::vector<long long> numbers;
    std::istringstream lines(dump);
    for (std::string line; std::getline(lines, line);) {
        const size_t at = line.find_first_not_of(' ');
        if (line.compare(at, key.size() + 2, key + ": ") == 0)
            numbers.push_back(std::stoll(line.substr(at + key.size() + 2)));
    }
    return numbers;
}

struct PlaceCase {
    const char* name;
    unsigned long long samples;
    _aafRational_t tapeRate;
    std::optional<long long> startOffset;
    std::optional<OrloReader::TimeCodeInfo> start;
    long long fileStart;   ///< where the file Mob's reference starts on the tape
    long long tapeLength;  ///< the tape slot's length
};

void PrintTo(const PlaceCase& c, std::ostream* out) { *out << c.name; }

class AAFFromMoviePlace : public BuilderTest, public ::testing::WithParamInterface<PlaceCase> {};

// 48 hours at 48000/1 are 8294400000 units. An offset from a timecode is
// worked out in single precision: 1920 x 2159999 is 4147198080, but
// 4147197952 here.
TEST_P(AAFFromMoviePlace, StartOffsetAndTapePadding) {
    const PlaceCase& c = GetParam();
    auto movie = Hand(c.samples, c.tapeRate);
    movie->SetHasMovieStartOffset(c.startOffset.has_value());
    movie->SetMovieStartOffset(c.startOffset.value_or(0));
    movie->SetHasMovieTimeCode(c.start.has_value());
    movie->SetMovieTimeCode(c.start.value_or(OrloReader::TimeCodeInfo()));
    aaftest::Ptr<IAAFFile> file;
    ASSERT_EQ(Build(movie.get(), file), TOV_OK);
    const std::string dump = Dump(file.get());
    // Start times: the Master's clip, the file Mob's, the tape's nil clip.
    EXPECT_EQ(Numbers(dump, "StartTime").at(1), c.fileStart);
    // The tape Mob comes last, its audio slot's clip last of all.
    EXPECT_EQ(Numbers(dump, "Length").back(), c.tapeLength);
}

using OrloReader::TimeCodeInfo;
constexpr long long kHours48 = 8294400000LL;
INSTANTIATE_TEST_SUITE_P(
    Cases, AAFFromMoviePlace,
    ::testing::Values(
        PlaceCase{"NoStart", 48000, {25, 1}, {}, {}, 0, 48000 + kHours48},
        PlaceCase{"FortyEightHours", kHours48, {25, 1}, {}, {}, 0, kHours48},
        PlaceCase{"OneUnitLess", kHours48 - 1, {25, 1}, {}, {}, 0, kHours48 - 1 + kHours48},
        PlaceCase{
            "GivenOffsetWins", 100, {25, 1}, 12345, TimeCodeInfo(1, 0, 0, 0, 25, false, 90000), 12345, 100 + kHours48},
        PlaceCase{"LongTimecode",
                  100,
                  {25, 1},
                  {},
                  TimeCodeInfo(23, 59, 59, 24, 25, false, 2159999),
                  4147197952LL,
                  100 + kHours48},
        PlaceCase{"DropFrame",
                  100,
                  {30000, 1001},
                  {},
                  TimeCodeInfo(1, 0, 0, 0, 30, true, 107892),
                  172799824LL,
                  100 + kHours48}),
    [](const auto& info) { return std::string(info.param.name); });

TEST_F(AAFFromMovie, BadArgumentsAndATrackWithoutMediaLeaveTheResultAlone) {
    auto movie = Hand(100, {25, 1});
    IAAFFile* const untouched = reinterpret_cast<IAAFFile*>(&movie);
    IAAFFile* out = untouched;
    const ZEB::ZEBString path = Text("/media/clip.wav");
    EXPECT_EQ(ZEB::Impl::NewAAFFromMovie(movie.get(), path, nullptr, host.Get()), TOV_E_INVALIDARG);
    EXPECT_EQ(ZEB::Impl::NewAAFFromMovie(nullptr, path, &out, host.Get()), TOV_E_INVALIDARG);
    EXPECT_EQ(ZEB::Impl::NewAAFFromMovie(movie.get(), Text(""), &out, host.Get()), TOV_E_INVALIDARG);
    EXPECT_EQ(ZEB::Impl::NewAAFFromMovie(movie.get(), ZEB::ZEBString(), &out, host.Get()), TOV_E_INVALIDARG);
    // The transient file opened by then stays allocated.
    movie->AddTrack(nullptr);
    EXPECT_EQ(ZEB::Impl::NewAAFFromMovie(movie.get(), path, &out, host.Get()), TOV_E_UNEXPECTED);
    EXPECT_EQ(out, untouched);
}

// In a copy of this program with no AAF library beside it, the loader cannot
// load one, and its failure is the result.
TEST_F(AAFFromMovie, WithoutTheLibraryTheLoadersFailureComesBack) {
    const std::filesystem::path self = std::filesystem::read_symlink("/proc/self/exe");
    if (!std::filesystem::exists(self.parent_path() / "libcom-api.so")) {
        aaftest::Ptr<IAAFFile> file;
        EXPECT_EQ(Build(Hand(100, {25, 1}).get(), file), AAFRESULT_DLL_LOAD_FAILED);
        return;
    }
    const std::filesystem::path copy = std::filesystem::path(folder) / self.filename();
    std::filesystem::copy_file(self, copy);
    const ToolOutcome outcome =
        RunTool(copy.string(), "--gtest_filter=AAFFromMovie.WithoutTheLibraryTheLoadersFailureComesBack");
    EXPECT_EQ(outcome.status, 0) << outcome.out;
    EXPECT_NE(outcome.out.find("[  PASSED  ] 1 test"), std::string::npos) << outcome.out;
}

}  // namespace
