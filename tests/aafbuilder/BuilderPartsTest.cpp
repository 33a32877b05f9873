// The builder's pieces as tables: the frame rate text of the bin column, the
// PCM descriptor of a media, and file URLs both ways.
#include <memory>
#include <optional>

#include "AAFTestFile.h"
#include "BuilderTest.h"
#include "aafbuilder/AddAudioDescriptor.h"
#include "aafbuilder/FrameRateAndDropToString.h"
#include "volume/URLUtils.h"

namespace {

using aaftest::Ptr;
using aaftest::Query;
using namespace OrloReader;

struct RateText {
    _aafRational_t rate;
    bool drop;
    const char* text;
};

TEST(FrameRateAndDropToString, BaseByNumeratorSuffixByWholeFrames) {
    const RateText table[] = {
        {{24, 1}, true, "24"},          {{24000, 1001}, false, "23.98"}, {{25, 1}, false, "25"},
        {{25000, 1000}, true, "25"},    {{30, 1}, false, "30 NDF"},      {{30, 1}, true, "30 DF"},
        {{30000, 1001}, true, "29.97"}, {{60, 1}, false, " NDF"},        {{48, 1}, true, ""},
        {{30, 0}, true, "30"},  // no whole frames without a denominator
    };
    for (const RateText& row : table)
        EXPECT_EQ(ZEB::Impl::FrameRateAndDropToString(row.rate, row.drop), row.text)
            << row.rate.numerator << "/" << row.rate.denominator << (row.drop ? " drop" : "");
}

constexpr aafUID_t kFloat = {0x0E040202, 0x0101, 0x0000, {0x06, 0x0E, 0x2B, 0x34, 0x04, 0x01, 0x01, 0x01}};
constexpr aafUID_t kBigEndian = {0x0F020202, 0x0301, 0x0100, {0x06, 0x0E, 0x2B, 0x34, 0x04, 0x01, 0x01, 0x01}};

struct DescriptorCase {
    const char* name;
    bool sound;  ///< whether the media has a sound descriptor
    int format;
    double rate;
    bool bigEndian;
    bool floatingPoint;
    TOVRESULT result;
    std::optional<aafUID_t> compression;
    aafUInt32 averageBPS;
    aafInt32 rateNumerator;
};

void PrintTo(const DescriptorCase& c, std::ostream* out) { *out << c.name; }

std::shared_ptr<Media> AudioMedia(const DescriptorCase& c) {
    auto sound = c.sound ? std::make_shared<AudioMediaDescriptor>(static_cast<AudioFormat>(c.format), c.rate, 4, 4, 2,
                                                                  16, c.bigEndian, c.floatingPoint, 0)
                         : nullptr;
    return std::make_shared<Media>(sound, kMediaTypeAudio, TimeCodeInfo(), 2, 1000);
}

class AddAudioDescriptorTable : public BuilderTest, public ::testing::WithParamInterface<DescriptorCase> {};

TEST_P(AddAudioDescriptorTable, FillsThePCMDescriptor) {
    const DescriptorCase& c = GetParam();
    aaftest::TransientFile f(&AAFFileOpenTransient);
    auto pcm = f.Create<IAAFPCMDescriptor>(kAAFClassID_PCMDescriptor);
    ASSERT_EQ(pcm->Initialize(), AAFRESULT_SUCCESS);
    ASSERT_EQ(ZEB::Impl::AddAudioDescriptor(pcm.get(), AudioMedia(c)), c.result);
    if (c.result != TOV_OK) return;
    auto sound = Query<IAAFSoundDescriptor>(pcm.get());
    aafUID_t compression{};
    const bool hasCompression = AAFRESULT_SUCCEEDED(sound->GetCompression(&compression));
    EXPECT_EQ(hasCompression ? std::optional<aafUID_t>(compression) : std::nullopt, c.compression);
    aafUInt32 bps = 0;
    EXPECT_EQ(pcm->GetAverageBPS(&bps), AAFRESULT_SUCCESS);
    EXPECT_EQ(bps, c.averageBPS);
    aafRational_t rate{};
    EXPECT_EQ(Query<IAAFFileDescriptor>(pcm.get())->GetSampleRate(&rate), AAFRESULT_SUCCESS);
    EXPECT_EQ(rate.numerator, c.rateNumerator);
    EXPECT_EQ(rate.denominator, 1);
}

INSTANTIATE_TEST_SUITE_P(
    Media, AddAudioDescriptorTable,
    ::testing::Values(DescriptorCase{"LittleEndianInteger", true, 0, 48000, false, false, TOV_OK, {}, 192000, 48000},
                      DescriptorCase{"Float", true, 0, 48000, false, true, TOV_OK, kFloat, 192000, 48000},
                      DescriptorCase{"BigEndian", true, 0, 48000, true, false, TOV_OK, kBigEndian, 192000, 48000},
                      DescriptorCase{"BigEndianFloat", true, 0, 48000, true, true, TOV_OK, kFloat, 192000, 48000},
                      // The byte rate from the exact rate, the rational from its whole part.
                      DescriptorCase{"FractionalRate", true, 0, 44100.5, false, false, TOV_OK, {}, 176402, 44100},
                      DescriptorCase{"NotPCM", true, 1, 48000, false, false, ZEB_E_AAFCREATE, {}, 0, 0},
                      DescriptorCase{"NoSound", false, 0, 0, false, false, ZEB_E_NOSOUNDDESCRIPTOR, {}, 0, 0}),
    [](const auto& info) { return std::string(info.param.name); });

TEST_F(BuilderTest, MultipleDescriptorTakesTheFirstRate) {
    aaftest::TransientFile f(&AAFFileOpenTransient);
    auto multiple = f.Create<IAAFMultipleDescriptor>(kAAFClassID_MultipleDescriptor);
    ASSERT_EQ(multiple->Initialize(), AAFRESULT_SUCCESS);
    DescriptorCase media{"", true, 0, 48000, false, false, TOV_OK, {}, 0, 0};
    ASSERT_EQ(ZEB::Impl::AddAudioDescriptor(nullptr, f.dictionary.get(), multiple.get(), AudioMedia(media)), TOV_OK);
    media.rate = 96000;
    ASSERT_EQ(ZEB::Impl::AddAudioDescriptor(nullptr, f.dictionary.get(), multiple.get(), AudioMedia(media)), TOV_OK);
    EXPECT_EQ(ZEB::Impl::AddAudioDescriptor(nullptr, f.dictionary.get(), nullptr, AudioMedia(media)), TOV_E_POINTER);
    aafUInt32 count = 0;
    EXPECT_EQ(multiple->CountFileDescriptors(&count), AAFRESULT_SUCCESS);
    EXPECT_EQ(count, 2u);
    aafRational_t rate{};
    EXPECT_EQ(Query<IAAFFileDescriptor>(multiple.get())->GetSampleRate(&rate), AAFRESULT_SUCCESS);
    EXPECT_EQ(rate.numerator, 48000);
}

struct URLRow {
    const char* path;
    const char* url;
};

TEST_F(BuilderTest, PathsBecomeFileURLs) {
    const URLRow table[] = {
        {"/a b/c.wav", "file:///a%20b/c.wav"},
        {"//server/x", "file://server/x"},
        {"\\\\server\\x", "file://server/x"},
        {"/#%{}|^~[]`()!*+$,;?:@=&<>.wav",
         "file:///%23%25%7B%7D%7C%5E%7E%5B%5D%60%28%29%21%2A%2B%24%2C%3B%3F%3A%40%3D%26%3C%3E.wav"},
        {"/caf\xC3\xA9.wav", "file:///caf\xC3\xA9.wav"},
        {"take/1.wav", "file://take/1.wav"},
    };
    for (const URLRow& row : table) {
        ZEB::ZEBString url;
        ASSERT_EQ(ZEB::MakeURLPathFromFilePath(Text(row.path).InArg(), url.OutArg()), TOV_OK) << row.path;
        EXPECT_EQ(url.GetUnicodeType(), kTOVUnicodeWCHAR);
        url.ConvertTo(kTOVUnicodeUTF8);
        EXPECT_STREQ(reinterpret_cast<const char*>(url.GetUTF8String()), row.url) << row.path;
    }
    ZEB::ZEBString url;
    EXPECT_EQ(ZEB::MakeURLPathFromFilePath(Text("").InArg(), url.OutArg()), TOV_E_INVALIDARG);
    EXPECT_EQ(ZEB::MakeURLPathFromFilePath(nullptr, url.OutArg()), TOV_E_INVALIDARG);
    EXPECT_EQ(ZEB::MakeURLPathFromFilePath(Text("/a").InArg(), nullptr), TOV_E_INVALIDARG);
}

struct BackRow {
    bool partial;
    const char* url;
    TOVRESULT result;
    const char* path;
};

TEST_F(BuilderTest, FileURLsBecomePaths) {
    const BackRow table[] = {
        {false, "file:///a%20b/c.wav", TOV_OK, "a b/c.wav"},
        // Eight bytes go from the front wherever the prefix stands.
        {false, "x:file:///a", TOV_OK, "//a"},
        // An escape is one character of that value, not a UTF-8 byte.
        {false, "file:///%e9%41", TOV_OK,
         "\xC3\xA9"
         "A"},
        {false, "file://server/x", TOV_E_INVALIDARG, ""},
        {false, "", TOV_E_INVALIDARG, ""},
        {true, "a%20b%2", TOV_OK, "a b\x02"},
        {true, "", TOV_E_INVALIDARG, ""},
    };
    for (const BackRow& row : table) {
        ZEB::ZEBString path = Text("unchanged");
        const auto convert =
            row.partial ? &ZEB::AAFUtils::MakeFilePathFromPartialURLPath : &ZEB::AAFUtils::MakeFilePathFromURLPath;
        ASSERT_EQ(convert(Text(row.url), path), row.result) << row.url;
        path.ConvertTo(kTOVUnicodeUTF8);
        EXPECT_STREQ(reinterpret_cast<const char*>(path.GetUTF8String()), row.result == TOV_OK ? row.path : "unchanged")
            << row.url;
    }
}

}  // namespace
