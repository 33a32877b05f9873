// The name readers and filters of both schemes, the layouts of the channel
// labels and the label walk, without files: what decides which names in a
// folder may be members and which channel each gets.
#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

#include "ClipTest.h"
#include "grouping/AreZEBStringsEqual.h"
#include "grouping/GetFileExtension.h"
#include "grouping/TesselFilter.h"
#include "grouping/TesselGrouping.h"
#include "grouping/UTF8Name.h"
#include "grouping/VTImportFilter.h"
#include "grouping/VTImportGrouping.h"

namespace {

using Grouping::NameText;
using Grouping::UTF8Name;
using OrloReader::Track;
using TesselGrouping::TesselGroupingInfo;

using GroupNames = ClipFixture;

// "-" when the reader refuses the name.
template <class Reader>
std::string Read(Reader reader, const char* name) {
    ZEB::ZEBString out;
    return reader(NameText(name), out) ? UTF8Name(out) : "-";
}

TEST_F(GroupNames, PrefixesLabelsAndExtensions) {
    const struct {
        const char* name;
        const char* numberedPrefix;
        const char* labelBase;
        const char* label;
        const char* extension;
    } cases[] = {
        {"Take7_3.wav", "Take7_", "-", "-", ".wav"},
        {"Take 1.wav", "Take ", "-", "-", ".wav"},
        // The last delimiter may stand behind the last dot.
        {"a_1.b-c", "a_1.b-", "-", "-", ".b-c"},
        {"Take_1.L.wav", "Take_", "Take_1", ".L", ".wav"},
        {"Mix.b.L.wav", "-", "Mix.b", ".L", ".wav"},
        {"Mix.L", "-", "-", "-", ".L"},
        {".L.wav", "-", "", ".L", ".wav"},
        {"Take7", "-", "-", "-", ""},
        {"", "-", "-", "-", ""},
    };
    for (const auto& c : cases) {
        EXPECT_EQ(Read(VTImportGrouping::GetPreIndexFileName, c.name), c.numberedPrefix) << c.name;
        EXPECT_EQ(Read(TesselGrouping::GetPreIndexFileName, c.name), c.labelBase) << c.name;
        EXPECT_EQ(Read(TesselGrouping::GetChannelLabel, c.name), c.label) << c.name;
        EXPECT_EQ(UTF8Name(HelperFunctions::GetFileExtension(NameText(c.name))), c.extension) << c.name;
    }
    // The label comes back in the name's own encoding.
    ZEB::ZEBString name = NameText("Mix.Ls.wav"), label;
    name.ConvertTo(kTOVUnicodeUTF16);
    ASSERT_TRUE(TesselGrouping::GetChannelLabel(name, label));
    EXPECT_EQ(label.GetUnicodeType(), kTOVUnicodeUTF16);
}

TEST_F(GroupNames, FiltersTakeNamesOfTheirOwnPattern) {
    const VTImportGrouping::VTImportFilter numbered(NameText("Take7_3.wav"));
    const TesselGrouping::TesselFilter labelled(NameText("Mix.L.wav"));
    const struct {
        std::string name;
        bool numberedMember;
        bool labelledMember;
    } cases[] = {
        {"Take7_12.wav", true, false},
        {"TAKE7_x.WAV", true, false},
        {"Take7_123.wav", false, false},
        {"Take7_1.aif", false, false},
        {"Take7-1.wav", false, false},
        {"mix.Lss.Wav", false, true},
        {"Mix.Lsss.wav", false, false},
        {"Mix.wav", false, true},
        {"Take7_\xC3\xA9.wav", true, false},
        // Not UTF-8: an overlong dot, a stray continuation byte, a cut sequence.
        {"Take7_1\xC0\xAE", false, false},
        {"Take7_\x80.wav", false, false},
        {"Mix.\xE2\x82.wav", false, false},
    };
    for (const auto& c : cases) {
        EXPECT_EQ(numbered(c.name), c.numberedMember) << c.name;
        EXPECT_EQ(labelled(c.name), c.labelledMember) << c.name;
    }
    // Only ASCII letters match in either case; other characters exactly.
    const VTImportGrouping::VTImportFilter accented(NameText("Sc\xC3\xA8ne_1.wav"));
    EXPECT_TRUE(accented("SC\xC3\xA8NE_2.WAV"));
    EXPECT_FALSE(accented("Sc\xC3\x88ne_2.wav"));
    // The counts are unsigned: a prefix and an extension that overlap refuse
    // even the name they were read from.
    EXPECT_FALSE(VTImportGrouping::VTImportFilter(NameText("a.b_c"))("a.b_c"));
    for (const char* name : {"Take7.wav", "Take7_1", "Mix.L.", ""})
        EXPECT_THROW(VTImportGrouping::VTImportFilter{NameText(name)}, std::logic_error) << name;
    for (const char* name : {"Mix.wav", "Mix.L", ".L.wav"})
        EXPECT_THROW(TesselGrouping::TesselFilter{NameText(name)}, std::logic_error) << name;
}

TEST_F(GroupNames, CharactersAreCountedAsTheHostCountsThem) {
    EXPECT_EQ(Grouping::CountUTF8Characters("a\xC3\xA9\xE2\x82\xAC\xF0\x9F\x8E\xA4"), 4u);
    EXPECT_EQ(Grouping::CountUTF8Characters(""), 0u);
    for (const char* bad : {"\xC1\xBF", "\xE0\x9F\xBF", "\xED\xA0\x80", "\xF4\x90\x80\x80", "\xF5", "\xF0\x9F\x8E"})
        EXPECT_FALSE(Grouping::CountUTF8Characters(bad)) << bad;
}

TEST_F(GroupNames, LabelsAndLayouts) {
    const TesselGroupingInfo info;
    const auto labels = [](std::initializer_list<const char*> texts) {
        std::vector<ZEB::ZEBString> out;
        for (const char* text : texts) out.push_back(NameText(text));
        return out;
    };
    EXPECT_EQ(info.GetLabelIndex(TesselGroupingInfo::CHANNEL_SET_71, NameText(".lfe")), 8);
    EXPECT_EQ(info.GetLabelIndex(TesselGroupingInfo::CHANNEL_SET_51, NameText(".Lss")), 0);
    EXPECT_EQ(info.GetLabelIndex(TesselGroupingInfo::CHANNEL_SET_STEREO, ZEB::ZEBString()), 0);
    const auto full71 = labels({".L", ".C", ".R", ".Lss", ".Rss", ".Lsr", ".Rsr", ".LFE"});
    EXPECT_TRUE(info.IsASetOfChannels(TesselGroupingInfo::CHANNEL_SET_71, full71));
    EXPECT_TRUE(info.IsASetOfChannels(TesselGroupingInfo::CHANNEL_SET_STEREO, full71));
    EXPECT_FALSE(info.IsASetOfChannels(TesselGroupingInfo::CHANNEL_SET_51, full71));
    // A label found twice counts once.
    EXPECT_TRUE(info.IsASetOfChannels(TesselGroupingInfo::CHANNEL_SET_STEREO, labels({".L", ".l", ".R"})));
    EXPECT_FALSE(info.IsASetOfChannels(TesselGroupingInfo::CHANNEL_SET_STEREO, {}));

    EXPECT_TRUE(HelperFunctions::AreZEBStringsEqual(NameText(".LFE"), NameText(".lfe"), 0));
    EXPECT_FALSE(HelperFunctions::AreZEBStringsEqual(NameText(".LFE"), NameText(".lfe"), 1));
    EXPECT_FALSE(HelperFunctions::AreZEBStringsEqual(NameText(""), NameText(""), 0));
}

// Channels as "label:channel" in track order, the tracks told apart by their
// sample counts, which stand for their labels' places.
TEST_F(GroupNames, LabelWalkKeepsTheLargestFullLayoutHoldingTheOwnLabel) {
    const struct {
        std::vector<const char*> labels;
        const char* own;
        size_t leftovers;  ///< tracks of a failed first scheme, ahead of the labels' own
        const char* result;
    } cases[] = {
        {{".R", ".L"}, ".L", 0, "1:1 0:2"},
        {{".L", ".R", ".C", ".Ls"}, ".R", 0, "0:1 2:2 1:3"},
        {{".L", ".R", ".Ls"}, ".Ls", 0, "-"},
        {{".L", ".C"}, ".L", 0, "-"},
        // Out of step: the leftover takes the first label, the last member none.
        {{".L", ".R", ".C"}, ".L", 1, "3:0 0:1 2:2 1:3"},
    };
    for (const auto& c : cases) {
        std::vector<std::shared_ptr<Track>> tracks;
        std::vector<ZEB::ZEBString> labels;
        for (size_t i = 0; i < c.leftovers + c.labels.size(); ++i)
            tracks.push_back(std::make_shared<Track>(OrloReader::TimeCodeInfo(), 3, i, 0, nullptr));
        for (const char* label : c.labels) labels.push_back(NameText(label));
        std::string result = "-";
        if (TesselGrouping::InitTrackIndexesFromFilesSet(tracks, labels, NameText(c.own), TesselGroupingInfo())) {
            result.clear();
            for (const auto& track : tracks)
                result += (result.empty() ? "" : " ") + std::to_string(track->GetMedia()->GetSampleCount()) + ":" +
                          std::to_string(track->GetChannelIndex());
        }
        EXPECT_EQ(result, c.result) << c.own;
    }
}

}  // namespace
