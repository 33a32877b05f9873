// How a file's channels become tracks: the iXML track list when it describes
// every channel, the plain channel order otherwise, and the media of each.
#include <stdexcept>
#include <string>
#include <tuple>

#include "AudioFileWriter.h"
#include "ClipTest.h"

namespace {

using OrloReader::Movie;

// One TRACK entry; a negative interleave index or a null name leaves that element out.
std::string Track(int channel, int interleave, const char* name) {
    std::string entry = "<TRACK><CHANNEL_INDEX>" + std::to_string(channel) + "</CHANNEL_INDEX>";
    if (interleave >= 0) entry += "<INTERLEAVE_INDEX>" + std::to_string(interleave) + "</INTERLEAVE_INDEX>";
    if (name != nullptr) entry += std::string("<NAME>") + name + "</NAME>";
    return entry + "</TRACK>";
}

std::string Count(int count) { return "<TRACK_COUNT>" + std::to_string(count) + "</TRACK_COUNT>"; }

struct TrackCase {
    const char* name;
    uint16_t channels;
    std::string trackList;  // the TRACK_LIST's content; empty for none
    std::vector<int> channelIndices;
    std::vector<std::pair<std::string, std::string>> trks;
};
void PrintTo(const TrackCase& row, std::ostream* os) { *os << row.name; }

class TrackRoutes : public ClipFixture, public ::testing::WithParamInterface<TrackCase> {};

TEST_P(TrackRoutes, GiveChannelIndicesAndNames) {
    const TrackCase& c = GetParam();
    ClipFile file;
    file.channels = c.channels;
    if (!c.trackList.empty()) file.ixml = Ixml("<TRACK_LIST>" + c.trackList + "</TRACK_LIST>");
    const Movie movie = LoadFile(file);
    ASSERT_EQ(movie.GetTrackCount(), c.channelIndices.size() + 1);
    for (size_t i = 0; i < c.channelIndices.size(); ++i)
        EXPECT_EQ(movie.GetTrack(static_cast<unsigned>(i + 1))->GetChannelIndex(), c.channelIndices[i]) << i;
    std::vector<std::pair<std::string, std::string>> trks(movie.GetMovieTRKs().begin(), movie.GetMovieTRKs().end());
    EXPECT_EQ(trks, c.trks);
    EXPECT_EQ(movie.HasMovieTRKs(), !c.trks.empty());
    EXPECT_EQ(movie.IsMonoAudio(), c.channels == 1);
}

const TrackCase kTrackCases[] = {
    {"NoTrackList", 2, "", {0, 1}, {}},
    {"MonoWithOneEntry", 1, Track(2, 1, "Boom"), {2}, {{"TRK1", "Boom"}}},
    // Sorted by interleave index: the first track is the entry of index 1.
    {"SortedByInterleaveIndex",
     2,
     Track(1, 2, "Lav") + Track(2, 1, "Boom"),
     {2, 1},
     {{"TRK1", "Boom"}, {"TRK2", "Lav"}}},
    // TRACK_COUNT 3 with three entries on a stereo file: only two tracks.
    {"CountAboveChannels",
     2,
     Count(3) + Track(1, 1, "A") + Track(2, 2, "B") + Track(3, 3, "C"),
     {1, 2},
     {{"TRK1", "A"}, {"TRK2", "B"}}},
    // A count below the channels leaves the rest at their own index, unnamed.
    {"CountBelowChannels", 3, Count(1) + Track(5, 1, "A"), {5, 1, 2}, {{"TRK1", "A"}}},
    {"LengthDiffersFromChannels", 2, Track(1, 1, "A"), {0, 1}, {}},
    {"EntryWithoutInterleaveIgnoresList", 2, Track(1, 1, "A") + Track(2, -1, "B"), {0, 1}, {}},
    // The channel index is cut to 8 bits.
    {"ChannelIndexCutTo8Bits", 1, Track(300, 1, "X"), {44}, {{"TRK1", "X"}}},
    {"EntryWithoutNameGivesEmptyName", 1, Track(1, 1, nullptr), {1}, {{"TRK1", ""}}},
};
INSTANTIATE_TEST_SUITE_P(Routes, TrackRoutes, ::testing::ValuesIn(kTrackCases),
                         [](const auto& info) { return std::string(info.param.name); });

using MovieTRKs = ClipFixture;

TEST_F(MovieTRKs, NeverComeFromBextKeywords) {
    ClipFile file;
    file.bext = BextWith("sTRK1=Boom\r\nsTRK2=Lav\r\nsTRKA=Plant\r\n");
    const Movie movie = LoadFile(file);
    EXPECT_TRUE(movie.GetMovieTRKs().empty());
    EXPECT_FALSE(movie.HasMovieTRKs());
}

using TrackMedia = ClipFixture;

// Ten stereo 24-bit frames, laid out by a WAVE and by an AIFF file.
TEST_F(TrackMedia, SharesTheFilesLayoutInItsByteOrder) {
    ClipFile wave;
    wave.frames = 10;
    Payload::Comm comm;
    comm.frames = 10;
    comm.bits = 24;
    const struct {
        const char* name;
        std::string bytes;
        uint64_t start;
        bool bigEndian;
    } rows[] = {
        // RIFF header 12, fmt 8 + 16, data header 8.
        {"take.wav", wave.Bytes(), 44, false},
        // FORM header 12, COMM 8 + 18, SSND header 8 + offset and block size 8.
        {"take.aif",
         AudioFileWriter::Aiff()
             .Chunk("COMM", Payload::CommChunk(comm))
             .Chunk("SSND", Payload::SsndChunk(0, std::string(60, '\x10')))
             .Bytes(),
         54, true},
    };
    for (const auto& row : rows) {
        SCOPED_TRACE(row.name);
        Movie movie;
        ASSERT_EQ(Load(Write(row.name, row.bytes), movie), TOV_OK);
        ASSERT_EQ(movie.GetTrackCount(), 3u);
        for (unsigned i = 1; i <= 2; ++i) {
            const uint64_t start = row.start + 3 * (i - 1);
            const auto media = movie.GetTrack(i)->GetMedia();
            const auto descriptor = media->GetSoundDescriptor();
            ASSERT_NE(descriptor, nullptr);
            EXPECT_EQ(descriptor->GetStartOffset(), start);
            EXPECT_EQ(descriptor->GetBytesPerFrame(), 6u);
            EXPECT_EQ(descriptor->IsBigEndian(), row.bigEndian);
            EXPECT_EQ(media->GetSampleSize(0), 6u);
            EXPECT_EQ(media->GetSampleOffset(3), start + 18);
            EXPECT_EQ(media->GetNumberOfContiguousSamples(4), 6u);
            EXPECT_EQ(media->GetNumberOfContiguousSamples(11), 0u);
        }
        EXPECT_EQ(movie.GetTrack(0)->GetMedia()->GetSoundDescriptor(), nullptr);
        EXPECT_THROW(movie.GetTrack(3), std::logic_error);
    }
}

TEST(MediaStart, CountsFramesWithTwoDroppedAMinuteInDrop) {
    const struct {
        OrloReader::TimeCodeInfo start;
        long long frames;
    } cases[] = {
        {{1, 0, 0, 0, 25, false}, 90000},
        {{0, 1, 0, 2, 30, true}, 1800},
        {{0, 10, 0, 0, 30, true}, 17982},
        {{1, 0, 0, 0, 30, true}, 107892},
        // The drop count stays two at 60 as well.
        {{0, 1, 0, 0, 60, true}, 3598},
    };
    for (const auto& c : cases) {
        OrloReader::Media media(OrloReader::kMediaTypeTimecode);
        media.SetStartTimeCode(c.start);
        long long frames = 0;
        unsigned short fps = 0;
        bool drop = false;
        media.GetStartTimeCode(frames, fps, drop);
        EXPECT_EQ(std::make_tuple(frames, fps, drop),
                  std::make_tuple(c.frames, c.start.GetFPS(), c.start.IsDropFrame()));
    }
}

}  // namespace
