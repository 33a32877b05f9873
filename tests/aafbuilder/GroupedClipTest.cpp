// The clip of a group of mono files: the worked example (channels 1, 2 and 5,
// members of different lengths) against its golden dump, and the counts of
// slots that one channel index held twice, a channel index of 0 and a second
// timecode track leave on each Mob.
#include <regex>
#include <sstream>

#include "BuilderTest.h"
#include "GoldenDump.h"

namespace {

using namespace OrloReader;

// A grouped Movie as the scan makes one: `channels` in order, -1 standing for
// a timecode track; every member at /media/day1/Take_<channel>.wav, the
// second of them half as long as the group.
std::unique_ptr<Movie> Group(const std::vector<int>& channels) {
    auto movie = std::make_unique<Movie>();
    _aafMobID_t id{};
    for (size_t i = 0; i < sizeof id; ++i) reinterpret_cast<unsigned char*>(&id)[i] = static_cast<unsigned char>(i + 1);
    movie->SetMobID(id);
    movie->SetMovieName("14B/2");
    movie->SetMovieTapeID("Take_2.wav");
    movie->SetMovieEditRate({48000, 1});
    movie->SetTapeMobEditRate(FrameRateSettings(_aafRational_t{25, 1}, false));
    movie->SetMovieGroupLength(48000);
    movie->SetHasMovieGroupLength(true);
    movie->AddTrack(std::make_shared<Track>(kMediaTypeTimecode));
    int member = 0;
    for (const int channel : channels) {
        if (channel < 0) {
            movie->AddTrack(std::make_shared<Track>(kMediaTypeTimecode));
            continue;
        }
        auto sound = std::make_shared<AudioMediaDescriptor>(kAudioFormatPCM, 48000.0, 3, 3, 1, 24, false, false, 696);
        const std::string path = "/media/day1/Take_" + std::to_string(channel) + ".wav";
        movie->AddTrack(std::make_shared<Track>(
            TimeCodeInfo(), 3, ++member == 2 ? 24000 : 48000, static_cast<unsigned char>(channel), sound,
            ZEB::ZEBString(reinterpret_cast<const unsigned char*>(path.c_str())), _aafUID_t{}));
    }
    movie->SetIsMonophonicGroup(true);
    return movie;
}

// The slots of each Mob in the order of the file, "M" for the Master Mob and
// "S" for a Source Mob: "M2 S1 S1 S0 S3".
std::string SlotCounts(const std::string& dump) {
    const std::regex mob(R"(^      \[\d+\] (MasterMob|SourceMob)$)"), slots(R"(^        Slots: \[(\d+)\]$)");
    std::istringstream lines(dump);
    std::string counts, line;
    std::smatch match;
    while (std::getline(lines, line)) {
        if (std::regex_match(line, match, mob)) counts += std::string(counts.empty() ? "" : " ") + match[1].str()[0];
        if (std::regex_match(line, match, slots)) counts += match[1].str();
    }
    return counts;
}

TEST_F(BuilderTest, GroupedClipOfTheWorkedExample) {
    aaftest::Ptr<IAAFFile> file;
    ASSERT_EQ(Build(Group({1, 2, 5}).get(), file, "/media/day1/Take_2.wav"), TOV_OK);
    const std::string dump = Dump(file.get());
    EXPECT_EQ(SlotCounts(dump), "M3 S1 S1 S1 S6");
    aaftest::ExpectMatchesGolden(dump, std::string(AAFBUILDER_GOLDEN_DIR) + "/grouped_1_2_5.txt");
}

TEST_F(BuilderTest, GroupedClipSlotsPerMob) {
    const struct {
        std::vector<int> channels;
        const char* counts;
    } cases[] = {
        // The later of two files on one channel gets nothing, the last file Mob stays empty.
        {{1, 1, 2}, "M2 S1 S1 S0 S3"},
        // Channel 0 gets no slot.
        {{0, 1}, "M1 S1 S0 S2"},
        // A second timecode track: no file's step comes round, so no file gets slots.
        {{1, -1, 2}, "M0 S0 S0 S4"},
    };
    for (const auto& c : cases) {
        aaftest::Ptr<IAAFFile> file;
        ASSERT_EQ(Build(Group(c.channels).get(), file), TOV_OK);
        EXPECT_EQ(SlotCounts(Dump(file.get())), c.counts) << testing::PrintToString(c.channels);
    }
}

}  // namespace
