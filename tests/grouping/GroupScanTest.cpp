// The group scan over folders made at test time: the example tables of both
// schemes, the files it passes over, the identity of a group, the first
// scheme's leftovers meeting the second, and the Movie a group fills.
#include <gtest/gtest.h>
#include <sys/stat.h>

#include <algorithm>
#include <filesystem>
#include <memory>
#include <string>
#include <vector>

#include "ClipTest.h"
#include "grouping/FindAndParseFilesForGrouping.h"
#include "grouping/TesselGrouping.h"
#include "grouping/UTF8Name.h"

namespace {

using OrloReader::Movie;
using OrloReader::Track;
using Tracks = std::vector<std::shared_ptr<Track>>;

ZEB::ZEBString Text(const std::string& text) { return Grouping::NameText(text); }

// The members as "name:channel", in channel order and by name within one.
std::string Members(const Tracks& tracks) {
    std::vector<std::pair<int, std::string>> members;
    for (const auto& track : tracks)
        members.emplace_back(track->GetChannelIndex(),
                             std::filesystem::path(Grouping::UTF8Name(track->GetPathToSource())).filename().string());
    std::sort(members.begin(), members.end());
    std::string text;
    for (const auto& [channel, name] : members)
        text += (text.empty() ? "" : " ") + name + ":" + std::to_string(channel);
    return text;
}

class GroupScan : public ClipFixture {
protected:
    // A mono file of `frames` frames with the given bext chunk.
    std::string Mono(const std::string& name, uint32_t frames = 100, std::optional<Payload::Bext> bext = {},
                     const std::string& ixml = "") {
        ClipFile file;
        file.channels = 1;
        file.frames = frames;
        file.bext = bext;
        file.ixml = ixml;
        return Write(name, file.Bytes());
    }

    // "name" is a mono file of 100 frames, "name=N" one of N frames; "=stereo",
    // "=text", "=tiny" (too small for an identity), "=fifo" and "=dir" make
    // those instead.
    void Make(const std::string& spec) {
        const size_t at = spec.find('=');
        const std::string name = spec.substr(0, at), kind = at == std::string::npos ? "" : spec.substr(at + 1);
        ClipFile file;
        file.channels = kind == "stereo" ? 2 : 1;
        file.frames = kind == "tiny" ? 1 : kind.empty() || !std::isdigit(kind[0]) ? 100 : std::stoul(kind);
        if (kind == "text") {
            Write(name, "a shot list, not a recording\n");
        } else if (kind == "fifo") {
            ASSERT_EQ(mkfifo((folder + "/" + name).c_str(), 0600), 0);
        } else if (kind == "dir") {
            std::filesystem::create_directories(folder + "/" + name);
        } else {
            Write(name, file.Bytes());
        }
    }

    // FindAndParseFilesForGrouping from `path`, the group length starting at 100.
    bool Scan(const std::string& path, Tracks& tracks, long long& length, _aafMobID_t& id) {
        Movie movie;
        length = 100;
        return GroupingFunctions::FindAndParseFilesForGrouping(Text(path), tracks, {48000, 1}, length, &id, host.Get(),
                                                               movie);
    }

    // The identity the file has when taken alone.
    _aafMobID_t OwnID(const std::string& path) {
        Movie movie;
        EXPECT_EQ(movie.InitFromFile(Text(path), host.Get(), false), TOV_OK);
        return movie.GetMobID();
    }
};

TEST_F(GroupScan, FindsTheMembersOfEitherScheme) {
    const std::string longPrefix(240, 'L');
    const struct {
        const char* what;
        std::string given;
        std::vector<std::string> files;
        std::string members;  ///< "-" when no group forms
        long long length;
    } cases[] = {
        {"numbered example",
         "Take7_3.wav",
         {"Take7_1.wav", "take7_2.WAV", "Take7_3.wav", "Take7_12.wav", "Take7_123.wav", "Take7_x.wav", "Take7_0.wav",
          "Take7_65.wav", "Take7_1.aif", "Take7-1.wav"},
         "Take7_1.wav:1 take7_2.WAV:2 Take7_3.wav:3 Take7_12.wav:12",
         100},
        {"one match", "T_1.wav", {"T_1.wav", "U_2.wav"}, "-", 0},
        {"passed over",
         "T_1.wav",
         {"T_1.wav", "T_2.wav=stereo", "T_3.wav=250", "T_4.wav=text", "T_5.wav=tiny", "T_6.wav=fifo", "T_7.wav=dir",
          "T_8\xFF.wav"},
         "T_1.wav:1 T_3.wav:3",
         250},
        {"one number twice", "a_1.wav", {"a_01.wav", "a_1.wav"}, "a_01.wav:1 a_1.wav:1", 100},
        {"space", "Take 1.wav", {"Take 1.wav", "Take 2.wav"}, "Take 1.wav:1 Take 2.wav:2", 100},
        {"given without a number", "T_x.wav", {"T_x.wav", "T_1.wav", "T_2.wav"}, "-", 0},
        {"long names",
         longPrefix + "_1.wav",
         {longPrefix + "_1.wav", longPrefix + "_2.wav"},
         longPrefix + "_1.wav:1 " + longPrefix + "_2.wav:2",
         100},
        {"label after a number",
         "Take_1.L.wav",
         {"Take_1.L.wav", "Take_1.R.wav"},
         "Take_1.L.wav:1 Take_1.R.wav:2",
         100},
        {"stereo", "Mix.L.wav", {"Mix.L.wav", "Mix.R.wav"}, "Mix.L.wav:1 Mix.R.wav:2", 100},
        {"LCR", "Mix.L.wav", {"Mix.L.wav", "Mix.C.wav", "Mix.R.wav"}, "Mix.L.wav:1 Mix.C.wav:2 Mix.R.wav:3", 100},
        {"Ls drops out",
         "Mix.L.wav",
         {"Mix.L.wav", "Mix.R.wav", "Mix.C.wav", "Mix.Ls.wav"},
         "Mix.L.wav:1 Mix.C.wav:2 Mix.R.wav:3",
         100},
        {"no full set", "Mix.L.wav", {"Mix.L.wav", "Mix.C.wav"}, "-", 0},
        {"5.1 without LFE",
         "Mix.L.wav",
         {"Mix.L.wav", "Mix.C.wav", "Mix.R.wav", "Mix.Ls.wav", "Mix.Rs.wav"},
         "Mix.L.wav:1 Mix.C.wav:2 Mix.R.wav:3",
         100},
        {"own label outside", "Mix.Ls.wav", {"Mix.L.wav", "Mix.R.wav", "Mix.Ls.wav"}, "-", 0},
        {"letter case",
         "Mix.L.wav",
         {"mix.L.wav", "Mix.L.wav", "Mix.R.wav"},
         "Mix.L.wav:1 mix.L.wav:1 Mix.R.wav:2",
         100},
        {"base with a dot",
         "Mix.b.L.wav",
         {"Mix.b.L.wav", "Mix.b.R.wav", "Mix.L.wav"},
         "Mix.b.L.wav:1 Mix.b.R.wav:2",
         100},
    };
    int row = 0;
    for (const auto& c : cases) {
        const std::string sub = "row" + std::to_string(++row) + "/";
        for (const std::string& file : c.files) Make(sub + file);
        Tracks tracks;
        long long length = 0;
        _aafMobID_t id{};
        const bool grouped = Scan(folder + "/" + sub + c.given, tracks, length, id);
        EXPECT_EQ(grouped ? Members(tracks) : "-", c.members) << c.what;
        if (grouped) {
            EXPECT_EQ(length, c.length) << c.what;
        }
    }
}

TEST_F(GroupScan, PathsWithoutAReadableFolderAreTakenAlone) {
    for (const std::string path : {"/nonexistent/T_1.wav", "T_1.wav", "/T_1.wav", ""}) {
        Tracks tracks;
        long long length = 0;
        _aafMobID_t id{};
        id.instanceLow = 7;
        EXPECT_FALSE(Scan(path, tracks, length, id)) << path;
        EXPECT_TRUE(tracks.empty()) << path;
        EXPECT_EQ(id.instanceLow, 7) << path;
    }
}

// Every member gives the same identity: the label part of the member of the
// lowest number, or of the label that sorts last, and a material of its own.
TEST_F(GroupScan, EveryMemberGivesTheGroupsIdentity) {
    const struct {
        std::vector<std::string> names;
        size_t base;
    } cases[] = {{{"T_2.wav", "T_1.wav", "T_3.wav"}, 1}, {{"Mix.L.wav", "Mix.R.wav"}, 1}};
    for (const auto& c : cases) {
        std::vector<std::string> paths;
        for (size_t i = 0; i < c.names.size(); ++i) {
            // Each member's UMID has a label and a material of its own.
            Payload::Bext bext = BextWith("");
            bext.umid = std::string("\x06\x0A\x2B\x34\x01\x01\x01\x05\x01\x01\x0D", 11) + char('A' + i) +
                        std::string("\x13\x00\x00\x00", 4) + std::string(16, char(0x21 + i)) + std::string(32, '\0');
            paths.push_back(Mono(c.names[i], 100, bext));
        }
        const _aafMobID_t base = OwnID(paths[c.base]);
        _aafMobID_t first{};
        for (const std::string& path : paths) {
            Tracks tracks;
            long long length = 0;
            _aafMobID_t id = OwnID(path);
            ASSERT_TRUE(Scan(path, tracks, length, id)) << path;
            EXPECT_EQ(std::string(reinterpret_cast<const char*>(&id), 16),
                      std::string(reinterpret_cast<const char*>(&base), 16))
                << path;
            const _aafMobID_t own = OwnID(path);
            EXPECT_NE(std::memcmp(&id.material, &own.material, 16), 0) << path;
            if (path == paths[0]) first = id;
            EXPECT_EQ(std::memcmp(&id, &first, sizeof id), 0) << path;
        }
        std::filesystem::remove_all(folder);
        std::filesystem::create_directories(folder);
    }
}

// A track the first scheme kept is walked with the second scheme's labels:
// it takes the first label, and the last member is left with channel 0.
TEST_F(GroupScan, FirstSchemesLeftoversPutTheSecondOutOfStep) {
    Mono("Mix.L.wav");
    Mono("Mix.R.wav");
    auto leftover = std::make_shared<Track>(OrloReader::TimeCodeInfo(), 3, 100, 7, nullptr);
    Tracks tracks = {leftover};
    long long length = 100;
    _aafMobID_t id{};
    Movie movie;
    ASSERT_TRUE(TesselGrouping::GroupInTesselWay(Text(folder + "/Mix.L.wav"), tracks, {48000, 1}, length, &id,
                                                 host.Get(), movie));
    ASSERT_EQ(tracks.size(), 3u);
    EXPECT_EQ(tracks[0]->GetChannelIndex(), 0);
    EXPECT_NE(tracks[0], leftover);
    EXPECT_NE(leftover->GetChannelIndex(), 7);
}

TEST_F(GroupScan, AGroupFillsTheMovieWithItsMembers) {
    const auto trackList = [](int channel, const char* name) {
        return Ixml("<TRACK_LIST><TRACK_COUNT>1</TRACK_COUNT><TRACK><CHANNEL_INDEX>" + std::to_string(channel) +
                    "</CHANNEL_INDEX><INTERLEAVE_INDEX>1</INTERLEAVE_INDEX><NAME>" + name +
                    "</NAME></TRACK></TRACK_LIST>");
    };
    Payload::Bext timed = BextWith("");
    timed.timeReference = 48000 * 3600;
    const std::string given = Mono("T_1.wav", 100, timed, trackList(1, "Boom"));
    Mono("T_2.wav", 300, BextWith("sSCENE=5\r\n"), trackList(2, "Lav"));
    Write("T_3.wav", ClipFile().Bytes());

    Movie movie;
    ASSERT_EQ(Load(given, movie), TOV_OK);
    ASSERT_EQ(movie.GetTrackCount(), 3u);
    EXPECT_TRUE(movie.IsMonophonicGroup());
    EXPECT_FALSE(movie.IsMonoAudio());
    EXPECT_TRUE(movie.HasMovieGroupLength());
    EXPECT_EQ(movie.GetMovieGroupLength(), 300);
    // Scene from the one member that has it; track names from all.
    EXPECT_EQ(movie.GetMovieScene(), "5");
    EXPECT_EQ(movie.GetMovieTRKs().size(), 2u);
    EXPECT_EQ(movie.GetMovieTRKs().at("TRK2"), "Lav");
    std::string start, memberStart;
    movie.GetMovieTimeCode().ToString(start);
    for (unsigned int i = 1; i < 3; ++i) {
        EXPECT_EQ(movie.GetTrack(i)->GetChannelIndex(), i);
        movie.GetTrack(i)->GetMedia()->GetStartTimeCode().ToString(memberStart);
        EXPECT_EQ(memberStart, start);
    }
    EXPECT_EQ(start, "01:00:00:00");

    // Taken alone when the host says so, and a file of two channels always.
    for (const auto& [path, allow] : {std::pair{given, false}, std::pair{folder + "/T_3.wav", true}}) {
        Movie alone;
        ASSERT_EQ(alone.InitFromFile(Text(path), host.Get(), allow), TOV_OK);
        EXPECT_FALSE(alone.IsMonophonicGroup()) << path;
        EXPECT_FALSE(alone.HasMovieGroupLength()) << path;
    }
}

}  // namespace
