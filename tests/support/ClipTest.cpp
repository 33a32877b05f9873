#include "ClipTest.h"

#include <sys/stat.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>

#include "AudioFileWriter.h"
#include "boundary/DynamicToggles.h"
#include "startup/ZEBUtilLib.h"

std::string ClipFile::Bytes() const {
    Payload::Fmt fmt;
    fmt.channels = channels;
    fmt.bits = bits;
    fmt.rate = rate;
    AudioFileWriter writer = AudioFileWriter::Wave();
    writer.Chunk("fmt ", Payload::FmtChunk(fmt));
    if (bext) writer.Chunk("bext", Payload::BextChunk(*bext));
    if (!ixml.empty()) writer.Chunk("iXML", ixml);
    if (!umid.empty()) writer.Chunk("umid", umid);
    // Ramps, so that files of different lengths differ in every block.
    std::string samples(static_cast<size_t>(frames) * channels * ((bits + 7) / 8), '\0');
    for (size_t i = 0; i < samples.size(); ++i) samples[i] = static_cast<char>(i * 7 + 3);
    writer.Chunk("data", samples);
    return writer.Bytes();
}

std::string Ixml(const std::string& body) {
    return "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<BWFXML>\n<IXML_VERSION>2.10</IXML_VERSION>\n" + body +
           "</BWFXML>\n";
}

Payload::Bext BextWith(const std::string& keywords) {
    Payload::Bext bext;
    bext.description = keywords;
    bext.originationDate = "";
    bext.originationTime = "";
    return bext;
}

void ClipFixture::SetUp() {
    char pattern[] = "/tmp/orlo-clip-XXXXXX";
    ASSERT_NE(mkdtemp(pattern), nullptr);
    folder = pattern;
    ASSERT_EQ(ZEB::ZEBInitialize(host.Get()), TOV_OK);
    startup = std::make_unique<PluginStartup>(host->AsUnknown());
    ASSERT_EQ(startup->Result(), TOV_OK);
    host.ClearLines();
}

void ClipFixture::TearDown() {
    startup.reset();
    ZEB::ZEBTerminate();
    std::filesystem::remove_all(folder);
}

std::string ClipFixture::Write(const std::string& name, const std::string& bytes) {
    const std::filesystem::path path = std::filesystem::path(folder) / name;
    std::filesystem::create_directories(path.parent_path());
    std::ofstream(path, std::ios::binary) << bytes;
    return path.string();
}

TOVRESULT ClipFixture::Load(const std::string& path, OrloReader::Movie& movie) {
    return movie.InitFromFile(ZEB::ZEBString(reinterpret_cast<const unsigned char*>(path.c_str())), host.Get(), true);
}

OrloReader::Movie ClipFixture::LoadFile(const ClipFile& file, const std::string& name) {
    OrloReader::Movie movie;
    const TOVRESULT result = Load(Write(name, file.Bytes()), movie);
    EXPECT_EQ(result, TOV_OK);
    return movie;
}

void ClipFixture::SetToggle(const char* path, unsigned int value) {
    TOVPtr<ITOVComponentFactory> factory;
    factory.Assign(host.Get());
    ASSERT_EQ(ZEB::Impl::SetDynamicToggleValue(factory, path, value), TOV_OK);
}
