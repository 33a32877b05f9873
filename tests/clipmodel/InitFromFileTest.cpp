// What reaches the caller of the intake: failures as result codes with no
// Movie, the grouping setting, and the fields only the intake itself sets.
#include <string>

#include "AudioFileWriter.h"
#include "ClipTest.h"
#include "boundary/NewMovieFromFilePath.h"
#include "boundary/OrloConstants.h"
#include "tov/IHostSettings.h"

namespace {

using OrloReader::Movie;

TEST_F(ClipTest, FilesThatCannotBeReadGiveTheirCodeAndNoMovie) {
    Payload::Fmt fmt;
    const struct {
        const char* name;
        std::string bytes;
        TOVRESULT result;
    } cases[] = {
        {"text.wav", "this is not audio at all, only text with a wav name\n", TOV_E_UNEXPECTED},
        {"nodata.wav", AudioFileWriter::Wave().Chunk("fmt ", Payload::FmtChunk(fmt)).Bytes(), TOV_E_UNEXPECTED},
        // Large enough for an identity, so that the missing SSND is what fails.
        {"nossnd.aif",
         AudioFileWriter::Aiff()
             .Chunk("COMM", Payload::CommChunk(Payload::Comm{}))
             .Chunk("ANNO", std::string(200, 'a'))
             .Bytes(),
         TOV_E_UNEXPECTED},
        {"empty.wav", "", TOV_E_UNEXPECTED},
    };
    for (const auto& c : cases) {
        Movie* movie = reinterpret_cast<Movie*>(0x1);
        const std::string path = Write(c.name, c.bytes);
        EXPECT_EQ(ZEB::Impl::NewMovieFromFilePath(ZEB::ZEBString(reinterpret_cast<const unsigned char*>(path.c_str())),
                                                  &movie, host.Get()),
                  c.result)
            << c.name;
        EXPECT_EQ(movie, nullptr) << c.name;
    }
    Movie* movie = nullptr;
    const std::string missing = folder + "/missing.wav";
    EXPECT_EQ(ZEB::Impl::NewMovieFromFilePath(ZEB::ZEBString(reinterpret_cast<const unsigned char*>(missing.c_str())),
                                              &movie, host.Get()),
              TOV_E_UNEXPECTED);
    EXPECT_EQ(ZEB::Impl::NewMovieFromFilePath(ZEB::ZEBString(), &movie, host.Get()), TOV_E_INVALIDARG);
}

TEST_F(ClipTest, NewMovieFromFilePathHandsOverAFilledMovie) {
    ClipFile file;
    file.channels = 1;
    file.bext = BextWith("sSCENE=7\r\n");
    const std::string path = Write("Take7_3.wav", file.Bytes());
    Movie* movie = nullptr;
    ASSERT_EQ(ZEB::Impl::NewMovieFromFilePath(ZEB::ZEBString(reinterpret_cast<const unsigned char*>(path.c_str())),
                                              &movie, host.Get()),
              TOV_OK);
    ASSERT_NE(movie, nullptr);
    // A mono file's starting track index comes from its numbered name.
    EXPECT_EQ(movie->GetStartingTrackIndex(), 3);
    EXPECT_EQ(movie->GetMovieTapeID(), "Take7_3.wav");
    EXPECT_EQ(std::string(reinterpret_cast<const char*>(movie->GetFilePath().GetUTF8String())), path);
    delete movie;
}

TEST_F(ClipTest, StartingTrackIndexOnlyForMonoFiles) {
    EXPECT_EQ(LoadFile(ClipFile{}, "Take7_3.wav").GetStartingTrackIndex(), 1);
    ClipFile mono;
    mono.channels = 1;
    EXPECT_EQ(LoadFile(mono, "Take7_65.wav").GetStartingTrackIndex(), 1);
}

TEST_F(ClipTest, AnIxmlTextThatDoesNotParseIsIgnored) {
    ClipFile file;
    file.bext = BextWith("sSCENE=5\r\n");
    file.ixml = "<BWFXML><SCENE>12</SCENE>";  // never closed
    const Movie movie = LoadFile(file);
    EXPECT_EQ(movie.GetMovieScene(), "5");
}

TEST_F(ClipTest, AiffFilesAreBigEndianTracks) {
    std::string samples(4 * 3 * 2, '\x10');
    Payload::Comm comm;
    comm.frames = 4;
    comm.bits = 24;
    const std::string bytes = AudioFileWriter::Aiff()
                                  .Chunk("COMM", Payload::CommChunk(comm))
                                  .Chunk("SSND", Payload::SsndChunk(0, samples + std::string(64, '\x01')))
                                  .Bytes();
    Movie aiff;
    ASSERT_EQ(Load(Write("tone.aif", bytes), aiff), TOV_OK);
    ASSERT_EQ(aiff.GetTrackCount(), 3u);
    EXPECT_TRUE(aiff.GetTrack(1)->GetMedia()->GetSoundDescriptor()->IsBigEndian());
    EXPECT_EQ(aiff.GetTrack(1)->GetMedia()->GetSoundDescriptor()->GetStartOffset() + 3,
              aiff.GetTrack(2)->GetMedia()->GetSoundDescriptor()->GetStartOffset());
}

}  // namespace
