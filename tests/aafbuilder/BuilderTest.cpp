#include "BuilderTest.h"

#include <filesystem>
#include <fstream>

#include "aafbuilder/NewAAFFromMovie.h"
#include "boundary/NewMovieFromFilePath.h"
#include "startup/ZEBUtilLib.h"

void BuilderTest::SetUp() {
    char pattern[] = "/tmp/orlo-aafbuilder-XXXXXX";
    ASSERT_NE(mkdtemp(pattern), nullptr);
    folder = pattern;
    ASSERT_EQ(ZEB::ZEBInitialize(host.Get()), TOV_OK);
    startup = std::make_unique<PluginStartup>(host->AsUnknown());
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

std::unique_ptr<OrloReader::Movie> BuilderTest::Load(const std::string& name, const std::string& bytes) {
    const std::string path = folder + "/" + name;
    std::ofstream(path, std::ios::binary) << bytes;
    OrloReader::Movie* movie = nullptr;
    EXPECT_EQ(ZEB::Impl::NewMovieFromFilePath(Text(path), &movie, host.Get()), TOV_OK);
    return std::unique_ptr<OrloReader::Movie>(movie);
}

std::unique_ptr<OrloReader::Movie> BuilderTest::Hand(unsigned long long samples, _aafRational_t tapeRate) {
    using namespace OrloReader;
    auto movie = std::make_unique<Movie>();
    movie->SetMovieEditRate({48000, 1});
    movie->SetTapeMobEditRate(FrameRateSettings(tapeRate, false));
    movie->AddTrack(std::make_shared<Track>(kMediaTypeTimecode));
    auto sound = std::make_shared<AudioMediaDescriptor>(kAudioFormatPCM, 48000.0, 3, 3, 1, 24, false, false, 0);
    movie->AddTrack(std::make_shared<Track>(TimeCodeInfo(), 3, samples, 0, sound));
    movie->SetIsMonoAudio(true);
    return movie;
}

TOVRESULT BuilderTest::Build(OrloReader::Movie* movie, aaftest::Ptr<IAAFFile>& out, const std::string& path) {
    return ZEB::Impl::NewAAFFromMovie(movie, Text(path), out.out(), host.Get());
}
