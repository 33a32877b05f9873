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

class Intake : public ClipFixture {
protected:
    TOVRESULT NewMovie(const std::string& path, Movie** movie) {
        return ZEB::Impl::NewMovieFromFilePath(ZEB::ZEBString(reinterpret_cast<const unsigned char*>(path.c_str())),
                                               movie, host.Get());
    }
};

TEST_F(Intake, FilesThatCannotBeReadGiveTheirCodeAndNoMovie) {
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
        EXPECT_EQ(NewMovie(Write(c.name, c.bytes), &movie), c.result) << c.name;
        EXPECT_EQ(movie, nullptr) << c.name;
    }
    Movie* movie = nullptr;
    EXPECT_EQ(NewMovie(folder + "/missing.wav", &movie), TOV_E_UNEXPECTED);
    EXPECT_EQ(ZEB::Impl::NewMovieFromFilePath(ZEB::ZEBString(), &movie, host.Get()), TOV_E_INVALIDARG);
}

TEST_F(Intake, HandsOverAFilledMovie) {
    ClipFile file;
    file.channels = 1;
    file.bext = BextWith("sSCENE=7\r\n");
    const std::string path = Write("Take7_3.wav", file.Bytes());
    Movie* movie = nullptr;
    ASSERT_EQ(NewMovie(path, &movie), TOV_OK);
    ASSERT_NE(movie, nullptr);
    // A mono file's starting track index comes from its numbered name.
    EXPECT_EQ(movie->GetStartingTrackIndex(), 3);
    EXPECT_EQ(movie->GetMovieTapeID(), "Take7_3.wav");
    EXPECT_EQ(std::string(reinterpret_cast<const char*>(movie->GetFilePath().GetUTF8String())), path);
    delete movie;
    EXPECT_EQ(LoadFile(ClipFile{}, "Take7_3.wav").GetStartingTrackIndex(), 1) << "only a mono file's";
}

TEST_F(Intake, IgnoresAnIxmlTextThatDoesNotParse) {
    ClipFile file;
    file.bext = BextWith("sSCENE=5\r\n");
    file.ixml = "<BWFXML><SCENE>12</SCENE>";  // never closed
    EXPECT_EQ(LoadFile(file).GetMovieScene(), "5");
}

}  // namespace
