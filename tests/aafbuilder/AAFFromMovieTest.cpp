// Whole clips of one file, compared with golden dumps (ORLO_UPDATE_GOLDEN=1
// rewrites them); the numbers that the dumps cannot show for every case; and
// the failures.
#include <unistd.h>

#include <filesystem>
#include <optional>

#include "AAFTestFile.h"
#include "AudioFileWriter.h"
#include "BuilderTest.h"
#include "ChunkPayloads.h"
#include "ExampleTake.h"
#include "RunTool.h"
#include "aafbuilder/NewAAFFromMovie.h"

namespace {

using aaftest::Ptr;
using aaftest::Query;
using OrloReader::Movie;

class AAFFromMovie : public BuilderTest {
protected:
    void ExpectClip(Movie* movie, const std::string& golden, const std::string& path = "/media/day1/clip.wav") {
        FileRef file;
        ASSERT_EQ(Build(movie, file, path), TOV_OK);
        ExpectGolden(Dump(file.file), golden);
    }

    std::unique_ptr<Movie> ExampleTake() { return Load(Write(ExampleTake::kFileName, ExampleTake::File())); }
};

// The stereo example take: on tape, with comments from bext and iXML, TRK names
// among them; the start comes from the iXML samples since midnight.
TEST_F(AAFFromMovie, ExampleTakeOnTape) {
    auto movie = ExampleTake();
    ASSERT_TRUE(movie);
    ExpectClip(movie.get(), "example_take_on_tape.txt", "/media/day1/12A-T03.wav");
}

// Off tape: an import descriptor, the tape Mob named by the tape ID, and the
// two sound roll comments.
TEST_F(AAFFromMovie, ExampleTakeOffTape) {
    auto movie = ExampleTake();
    ASSERT_TRUE(movie);
    movie->SetIsMovieOnTape(false);
    ExpectClip(movie.get(), "example_take_off_tape.txt", "/media/day1/12A-T03.wav");
}

// A mono file named as the third of a group, with a second timecode track:
// tape slots TC1, AuxTC1 (fillers around it), A1 to A3; one Master slot A3.
TEST_F(AAFFromMovie, MonoThirdTrackWithAuxiliaryTimecode) {
    Payload::Fmt fmt;
    fmt.channels = 1;
    // A bext chunk for a shoot date that does not change; without production
    // keywords the file is not on a tape.
    const std::string bytes = AudioFileWriter::Wave()
                                  .Chunk("fmt ", Payload::FmtChunk(fmt))
                                  .Chunk("bext", Payload::BextChunk(Payload::Bext{}))
                                  .Chunk("data", std::string(3 * 480, '\x11'))
                                  .Bytes();
    auto movie = Load(Write("Take7_3.wav", bytes));
    ASSERT_TRUE(movie);
    ASSERT_EQ(movie->GetStartingTrackIndex(), 3);
    movie->AddTrack(std::make_shared<OrloReader::Track>(OrloReader::kMediaTypeTimecode));
    ExpectClip(movie.get(), "mono_third_aux_timecode.txt", "/media/day1/Take7_3.wav");
}

// The first slot of the Mob whose identifier differs from the clip's in byte
// 13 by `instance` (0 for the Master Mob): its Source Clip, inside the slot's
// one-element Sequence.
Ptr<IAAFSourceClip> ClipOf(IAAFFile* file, const Movie& movie, aafUInt8 instance, aafSlotID_t slotID) {
    Ptr<IAAFHeader> header;
    file->GetHeader(header.out());
    aafMobID_t id = movie.GetMobID();
    if (instance) id.instanceHigh = instance;
    Ptr<IAAFMob> mob;
    Ptr<IAAFMobSlot> slot;
    Ptr<IAAFSegment> segment;
    Ptr<IAAFComponent> component;
    if (AAFRESULT_FAILED(header->LookupMob(id, mob.out())) || AAFRESULT_FAILED(mob->LookupSlot(slotID, slot.out())) ||
        AAFRESULT_FAILED(slot->GetSegment(segment.out())) ||
        AAFRESULT_FAILED(Query<IAAFSequence>(segment.get())->GetComponentAt(0, component.out())))
        return Ptr<IAAFSourceClip>();
    return Query<IAAFSourceClip>(component.get());
}

struct PlaceCase {
    const char* name;
    unsigned long long samples;
    _aafRational_t tapeRate;
    std::optional<long long> startOffset;
    std::optional<OrloReader::TimeCodeInfo> start;
    aafPosition_t fileStart;  ///< where the file Mob's reference starts on the tape
    aafLength_t tapeLength;   ///< the tape slot's length
};

void PrintTo(const PlaceCase& c, std::ostream* out) { *out << c.name; }

class AAFFromMoviePlace : public BuilderTest, public ::testing::WithParamInterface<PlaceCase> {};

// 48 hours at 48000/1 are 8294400000 units. Offsets from a timecode are worked
// out in single precision: 1920 x 2159999 is 4147198080, but 4147197952 here.
TEST_P(AAFFromMoviePlace, StartOffsetAndTapePadding) {
    const PlaceCase& c = GetParam();
    HandClip clip;
    clip.samples = c.samples;
    clip.tapeRate = c.tapeRate;
    auto movie = Hand(clip);
    if (c.startOffset) {
        movie->SetMovieStartOffset(*c.startOffset);
        movie->SetHasMovieStartOffset(true);
    }
    if (c.start) {
        movie->SetMovieTimeCode(*c.start);
        movie->SetHasMovieTimeCode(true);
    }
    FileRef file;
    ASSERT_EQ(Build(movie.get(), file), TOV_OK);
    auto fileClip = ClipOf(file.file, *movie, 0xB1, 2);
    auto tapeClip = ClipOf(file.file, *movie, 0xA1, 2);
    ASSERT_TRUE(fileClip && tapeClip);
    aafSourceRef_t ref{};
    ASSERT_EQ(fileClip->GetSourceReference(&ref), AAFRESULT_SUCCESS);
    EXPECT_EQ(ref.startTime, c.fileStart);
    aafLength_t length = 0;
    ASSERT_EQ(Query<IAAFComponent>(tapeClip.get())->GetLength(&length), AAFRESULT_SUCCESS);
    EXPECT_EQ(length, c.tapeLength);
}

using OrloReader::TimeCodeInfo;
INSTANTIATE_TEST_SUITE_P(
    Cases, AAFFromMoviePlace,
    ::testing::Values(
        PlaceCase{"NoStart", 48000, {25, 1}, {}, {}, 0, 48000 + 8294400000LL},
        PlaceCase{"FortyEightHours", 8294400000ULL, {25, 1}, {}, {}, 0, 8294400000LL},
        PlaceCase{"OneUnitLess", 8294399999ULL, {25, 1}, {}, {}, 0, 8294399999LL + 8294400000LL},
        PlaceCase{"GivenOffsetWins",
                  100,
                  {25, 1},
                  12345,
                  TimeCodeInfo(1, 0, 0, 0, 25, false, 90000),
                  12345,
                  100 + 8294400000LL},
        PlaceCase{"ZeroTimecode", 100, {25, 1}, {}, TimeCodeInfo(0, 0, 0, 0, 25, false, 0), 0, 100 + 8294400000LL},
        PlaceCase{"LongTimecode",
                  100,
                  {25, 1},
                  {},
                  TimeCodeInfo(23, 59, 59, 24, 25, false, 2159999),
                  4147197952LL,
                  100 + 8294400000LL},
        PlaceCase{"DropFrame",
                  100,
                  {30000, 1001},
                  {},
                  TimeCodeInfo(1, 0, 0, 0, 30, true, 107892),
                  172799824LL,
                  100 + 8294400000LL}),
    [](const auto& info) { return std::string(info.param.name); });

TEST_F(AAFFromMovie, BadArgumentsLeaveTheResultAlone) {
    auto movie = Hand({});
    IAAFFile* untouched = reinterpret_cast<IAAFFile*>(&movie);
    IAAFFile* out = untouched;
    const ZEB::ZEBString path = Text("/media/clip.wav");
    EXPECT_EQ(ZEB::Impl::NewAAFFromMovie(movie.get(), path, nullptr, host.Get()), TOV_E_INVALIDARG);
    EXPECT_EQ(ZEB::Impl::NewAAFFromMovie(nullptr, path, &out, host.Get()), TOV_E_INVALIDARG);
    EXPECT_EQ(ZEB::Impl::NewAAFFromMovie(movie.get(), Text(""), &out, host.Get()), TOV_E_INVALIDARG);
    EXPECT_EQ(ZEB::Impl::NewAAFFromMovie(movie.get(), ZEB::ZEBString(), &out, host.Get()), TOV_E_INVALIDARG);
    // A track without media; the transient file opened by then stays allocated.
    movie->AddTrack(nullptr);
    EXPECT_EQ(ZEB::Impl::NewAAFFromMovie(movie.get(), path, &out, host.Get()), TOV_E_UNEXPECTED);
    EXPECT_EQ(out, untouched);
}

// In a copy of this program that has no AAF library beside it, the loader
// cannot load one, and its failure is the result.
TEST_F(AAFFromMovie, WithoutTheLibraryTheLoadersFailureComesBack) {
    const std::filesystem::path self = std::filesystem::read_symlink("/proc/self/exe");
    if (!std::filesystem::exists(self.parent_path() / "libcom-api.so")) {
        auto movie = Hand({});
        FileRef file;
        EXPECT_EQ(Build(movie.get(), file), AAFRESULT_DLL_LOAD_FAILED);
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
