#include "BuilderTest.h"

#include <filesystem>
#include <fstream>
#include <sstream>

#include "GoldenDump.h"
#include "aaf/dumpAAF.h"
#include "aafbuilder/NewAAFFromMovie.h"
#include "boundary/NewMovieFromFilePath.h"
#include "startup/ZEBUtilLib.h"

void BuilderTest::SetUp() {
    char pattern[] = "/tmp/orlo-aafbuilder-XXXXXX";
    ASSERT_NE(mkdtemp(pattern), nullptr);
    folder = pattern;
    ASSERT_EQ(ZEB::ZEBInitialize(host.Get()), TOV_OK);
    startup = std::make_unique<PluginStartup>(*host);
    ASSERT_EQ(startup->Result(), TOV_OK);
}

void BuilderTest::TearDown() {
    startup.reset();
    ZEB::ZEBTerminate();
    std::filesystem::remove_all(folder);
}

ZEB::ZEBString BuilderTest::Text(const std::string& text) {
    return ZEB::ZEBString(reinterpret_cast<const unsigned char*>(text.c_str()));
}

std::string BuilderTest::Write(const std::string& name, const std::string& bytes) {
    const std::string path = folder + "/" + name;
    std::ofstream(path, std::ios::binary) << bytes;
    return path;
}

std::unique_ptr<OrloReader::Movie> BuilderTest::Load(const std::string& path) {
    OrloReader::Movie* movie = nullptr;
    EXPECT_EQ(ZEB::Impl::NewMovieFromFilePath(Text(path), &movie, host.Get()), TOV_OK);
    return std::unique_ptr<OrloReader::Movie>(movie);
}

std::unique_ptr<OrloReader::Movie> BuilderTest::Hand(const HandClip& clip) {
    using namespace OrloReader;
    auto movie = std::make_unique<Movie>(
        _aafMobID_t{{0x06, 0x0A, 0x2B, 0x34, 0x01, 0x01, 0x01, 0x05, 0x01, 0x01, 0x0F, 0x20},
                    0x13,
                    0,
                    0,
                    0,
                    {0x4F524C4F, 0x0001, 0x0002, {0x10, 0x20, 0x30, 0x40, 0x50, 0x60, 0x70, 0x80}}});
    movie->SetMovieName("hand");
    movie->SetMovieTapeID("hand.wav");
    movie->SetMovieEditRate({48000, 1});
    movie->SetTapeMobEditRate(FrameRateSettings(clip.tapeRate, false));
    movie->AddTrack(std::make_shared<Track>(kMediaTypeTimecode));
    for (uint32_t c = 0; c < clip.channels; ++c) {
        auto sound = std::make_shared<AudioMediaDescriptor>(kAudioFormatPCM, 48000.0, 3 * clip.channels,
                                                            3 * clip.channels, clip.channels, 24, false, false, 0);
        movie->AddTrack(std::make_shared<Track>(TimeCodeInfo(), 3, clip.samples, static_cast<unsigned char>(c), sound));
    }
    movie->SetIsMonoAudio(clip.channels == 1);
    return movie;
}

TOVRESULT BuilderTest::Build(OrloReader::Movie* movie, FileRef& out, const std::string& path) {
    return ZEB::Impl::NewAAFFromMovie(movie, Text(path), &out.file, host.Get());
}

std::string BuilderTest::Dump(IAAFFile* file) {
    ZEB::AAFDumpOptions options;
    options.omitClock = true;
    std::ostringstream out;
    EXPECT_EQ(ZEB::dumpAAF(file, out, options), AAFRESULT_SUCCESS);
    return out.str();
}

void BuilderTest::ExpectGolden(const std::string& dump, const std::string& name) {
    aaftest::ExpectMatchesGolden(dump, std::string(AAFBUILDER_GOLDEN_DIR) + "/" + name);
}
