// The builder's pieces as tables: the frame rate text of the bin column, the
// PCM descriptor of a media, and file URLs both ways.
#include "AAFTestFile.h"
#include "BuilderTest.h"
#include "aafbuilder/AddAudioDescriptor.h"
#include "aafbuilder/FrameRateAndDropToString.h"
#include "volume/URLUtils.h"

namespace {

using aaftest::Query;
using namespace OrloReader;
using AddAudioDescriptor = BuilderTest;
using URLUtils = BuilderTest;

TEST(FrameRateAndDropToString, BaseByNumeratorSuffixByWholeFrames) {
    const struct {
        _aafRational_t rate;
        bool drop;
        const char* text;
    } table[] = {
        {{24, 1}, true, "24"},       {{24000, 1001}, false, "23.98"},
        {{25000, 1000}, true, "25"}, {{30, 1}, false, "30 NDF"},
        {{30, 1}, true, "30 DF"},    {{30000, 1001}, true, "29.97"},
        {{60, 1}, false, " NDF"},    {{48, 1}, true, ""},
        {{30, 0}, true, "30"},
    };
    for (const auto& row : table)
        EXPECT_EQ(ZEB::Impl::FrameRateAndDropToString(row.rate, row.drop), row.text)
            << row.rate.numerator << "/" << row.rate.denominator;
}

std::shared_ptr<Media> AudioMedia(double rate, bool bigEndian, bool floatingPoint, int format = kAudioFormatPCM) {
    auto sound = std::make_shared<AudioMediaDescriptor>(static_cast<AudioFormat>(format), rate, 4, 4, 2, 16, bigEndian,
                                                        floatingPoint, 0);
    return std::make_shared<Media>(sound, kMediaTypeAudio, TimeCodeInfo(), 2, 1000);
}

// Compression only for floating point (first) or big-endian data; the byte
// rate from the exact sample rate, the rational from its whole part.
TEST_F(AddAudioDescriptor, PCMDescriptorOfAMedia) {
    const struct {
        std::shared_ptr<Media> media;
        TOVRESULT result;
        const char* shows;
    } table[] = {
        {AudioMedia(48000, false, false), TOV_OK, "SampleRate: \"48000/1\""},
        {AudioMedia(48000, false, true), TOV_OK, "Compression: \"{0E040202-0101-0000-060E-2B3404010101}\""},
        {AudioMedia(48000, true, false), TOV_OK, "Compression: \"{0F020202-0301-0100-060E-2B3404010101}\""},
        {AudioMedia(48000, true, true), TOV_OK, "Compression: \"{0E040202-0101-0000-060E-2B3404010101}\""},
        {AudioMedia(44100.5, false, false), TOV_OK,
         "SampleRate: \"44100/1\"\n  Length: 1000\n  AudioSamplingRate: "
         "\"44100/1\"\n  Channels: 2\n  QuantizationBits: 16\n  BlockAlign: "
         "4\n  AverageBPS: 176402"},
        {AudioMedia(48000, false, false, 1), ZEB_E_AAFCREATE, ""},
        {std::make_shared<Media>(kMediaTypeAudio), ZEB_E_NOSOUNDDESCRIPTOR, ""},
    };
    for (const auto& row : table) {
        aaftest::TransientFile f(&AAFFileOpenTransient);
        auto pcm = f.Create<IAAFPCMDescriptor>(kAAFClassID_PCMDescriptor);
        ASSERT_EQ(pcm->Initialize(), AAFRESULT_SUCCESS);
        EXPECT_EQ(ZEB::Impl::AddAudioDescriptor(pcm.get(), row.media), row.result) << row.shows;
        const std::string dump = Dump(Query<IAAFObject>(pcm.get()).get());
        EXPECT_NE(dump.find(row.shows), std::string::npos) << dump;
        EXPECT_EQ(dump.find("Compression") != std::string::npos, std::string(row.shows).find("Compression") == 0);
    }
}

TEST_F(AddAudioDescriptor, MultipleDescriptorKeepsTheFirstRate) {
    aaftest::TransientFile f(&AAFFileOpenTransient);
    auto multiple = f.Create<IAAFMultipleDescriptor>(kAAFClassID_MultipleDescriptor);
    ASSERT_EQ(multiple->Initialize(), AAFRESULT_SUCCESS);
    for (double rate : {48000.0, 96000.0})
        ASSERT_EQ(ZEB::Impl::AddAudioDescriptor(nullptr, f.dictionary.get(), multiple.get(), AudioMedia(rate, 0, 0)),
                  TOV_OK);
    EXPECT_EQ(ZEB::Impl::AddAudioDescriptor(nullptr, f.dictionary.get(), nullptr, AudioMedia(48000, 0, 0)),
              TOV_E_POINTER);
    const std::string dump = Dump(Query<IAAFObject>(multiple.get()).get());
    EXPECT_EQ(dump.find("MultipleDescriptor\n  SampleRate: \"48000/1\""), 0u) << dump;
    EXPECT_NE(dump.find("FileDescriptors: [2]"), std::string::npos) << dump;
}

TEST_F(URLUtils, PathsBecomeFileURLs) {
    const struct {
        const char* path;
        const char* url;
    } table[] = {
        {"/a b/c.wav", "file:///a%20b/c.wav"},
        {"//server/x", "file://server/x"},
        {"\\\\server\\x", "file://server/x"},
        {"/#%{}|^~[]`()!*+$,;?:@=&<>.wav",
         "file:///%23%25%7B%7D%7C%5E%7E%5B%5D%60%28%29%21%2A%2B%24%2C%3B%3F%3A%40%3D%26%3C%3E.wav"},
        {"/caf\xC3\xA9.wav", "file:///caf\xC3\xA9.wav"},
        {"take/1.wav", "file://take/1.wav"},
        {"", nullptr},
    };
    for (const auto& row : table) {
        ZEB::ZEBString url;
        ASSERT_EQ(ZEB::MakeURLPathFromFilePath(Text(row.path).InArg(), url.OutArg()),
                  row.url ? TOV_OK : TOV_E_INVALIDARG)
            << row.path;
        if (!row.url) continue;
        EXPECT_EQ(url.GetUnicodeType(), kTOVUnicodeWCHAR);
        url.ConvertTo(kTOVUnicodeUTF8);
        EXPECT_STREQ(reinterpret_cast<const char*>(url.GetUTF8String()), row.url) << row.path;
    }
    EXPECT_EQ(ZEB::MakeURLPathFromFilePath(nullptr, nullptr), TOV_E_INVALIDARG);
}

TEST_F(URLUtils, FileURLsBecomePaths) {
    const struct {
        bool partial;
        const char* url;
        const char* path;  ///< null: TOV_E_INVALIDARG
    } table[] = {
        {false, "file:///a%20b/c.wav", "a b/c.wav"},
        {false, "x:file:///a", "//a"},  // eight bytes go wherever the prefix stands
        {false, "file:///%e9%41",
         "\xC3\xA9"
         "A"},  // one character of that value, not a UTF-8 byte
        {false, "file://server/x", nullptr},
        {false, "", nullptr},
        {true, "a%20b%2", "a b\x02"},
        {true, "", nullptr},
    };
    for (const auto& row : table) {
        ZEB::ZEBString path = Text("unchanged");
        const auto convert =
            row.partial ? &ZEB::AAFUtils::MakeFilePathFromPartialURLPath : &ZEB::AAFUtils::MakeFilePathFromURLPath;
        ASSERT_EQ(convert(Text(row.url), path), row.path ? TOV_OK : TOV_E_INVALIDARG) << row.url;
        path.ConvertTo(kTOVUnicodeUTF8);
        EXPECT_STREQ(reinterpret_cast<const char*>(path.GetUTF8String()), row.path ? row.path : "unchanged") << row.url;
    }
}

}  // namespace
