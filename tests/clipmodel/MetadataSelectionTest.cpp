// The order of trust between iXML, the `bext` keywords and the file itself,
// attribute by attribute, through whole files as recorders write them.
#include <optional>

#include "ClipTest.h"

namespace {

using OrloReader::Movie;

// A text attribute and its has flag, or nullopt when the flag is false.
struct TextCase {
    const char* name;
    std::string keywords;  // bext Description; "-" for no bext chunk
    std::string ixmlBody;  // empty for no iXML chunk
    std::optional<std::string> scene, take, ubits, notes;
};
void PrintTo(const TextCase& row, std::ostream* os) { *os << row.name; }

ClipFile FileOf(const std::string& keywords, const std::string& ixmlBody) {
    ClipFile file;
    if (keywords != "-") file.bext = BextWith(keywords);
    if (!ixmlBody.empty()) file.ixml = Ixml(ixmlBody);
    return file;
}

std::optional<std::string> Flagged(bool has, const std::string& value) {
    return has ? std::optional<std::string>(value) : std::nullopt;
}

class TextRules : public ClipFixture, public ::testing::WithParamInterface<TextCase> {};

TEST_P(TextRules, TakeTheirValueFromTheMostTrustedSource) {
    const TextCase& c = GetParam();
    const Movie movie = LoadFile(FileOf(c.keywords, c.ixmlBody));
    EXPECT_EQ(Flagged(movie.HasMovieScene(), movie.GetMovieScene()), c.scene);
    EXPECT_EQ(Flagged(movie.HasMovieTake(), movie.GetMovieTake()), c.take);
    EXPECT_EQ(Flagged(movie.HasMovieUBITS(), movie.GetMovieUBITS()), c.ubits);
    EXPECT_EQ(Flagged(movie.HasMovieNotes(), movie.GetMovieNotes()), c.notes);
}

const TextCase kTextCases[] = {
    {"NothingAnywhere", "-", "", std::nullopt, std::nullopt, std::nullopt, std::nullopt},
    {"IxmlBeatsBext", "sSCENE=9\r\nsTAKE=8\r\nsUBITS=11223344\r\nsNOTE=from bext\r\n",
     "<SCENE>12A</SCENE><TAKE>3</TAKE><UBITS>00112233</UBITS><NOTE>from ixml</NOTE>", "12A", "3", "$00112233",
     "from ixml"},
    {"BextAlone", "sSCENE=9\r\nsTAKE=8\r\nsUBITS=11223344\r\nsNOTE=  a plane  \r\n", "", "9", "8", "11223344",
     "a plane"},
    // An empty element has no has flag, so the keyword wins.
    {"EmptyIxmlSceneFallsBackToBext", "sSCENE=5\r\n", "<SCENE></SCENE>", "5", std::nullopt, std::nullopt, std::nullopt},
    // An empty keyword still counts as a scene.
    {"EmptyBextSceneCounts", "sSCENE=\r\n", "", "", std::nullopt, std::nullopt, std::nullopt},
    {"UbitsWithDollarKeepsIt", "-", "<UBITS>$0A0B0C0D</UBITS>", std::nullopt, std::nullopt, "$0A0B0C0D", std::nullopt},
    // iXML text is not trimmed: a NOTE of blanks hides the keyword, then counts as no notes.
    {"IxmlNoteOfBlanksHidesBext", "sNOTE=from bext\r\n", "<NOTE> </NOTE>", std::nullopt, std::nullopt, std::nullopt,
     " "},
    {"BextNoteOfBlanksIsNone", "sNOTE=    \r\n", "", std::nullopt, std::nullopt, std::nullopt, std::nullopt},
};
INSTANTIATE_TEST_SUITE_P(Sources, TextRules, ::testing::ValuesIn(kTextCases),
                         [](const auto& info) { return std::string(info.param.name); });

struct TapeCase {
    const char* name;
    std::string keywords;
    std::string date;  // bext origination date
    std::string ixmlBody;
    std::optional<std::string> tape;
};
void PrintTo(const TapeCase& row, std::ostream* os) { *os << row.name; }

class TapeRules : public ClipFixture, public ::testing::WithParamInterface<TapeCase> {};

TEST_P(TapeRules, FollowIxmlThenBextThenFileNameAndDay) {
    const TapeCase& c = GetParam();
    ClipFile file = FileOf(c.keywords, c.ixmlBody);
    if (file.bext) file.bext->originationDate = c.date;
    const Movie movie = LoadFile(file, "a.wav");
    EXPECT_EQ(Flagged(movie.HasMovieTape(), movie.GetMovieTape()), c.tape);
    EXPECT_EQ(movie.IsMovieOnTape(), c.tape.has_value());
    EXPECT_EQ(movie.GetMovieTapeID(), "a.wav");
}

const TapeCase kTapeCases[] = {
    {"IxmlTape", "sTAPE=B\r\n", "", "<TAPE>DAY07</TAPE>", "DAY07"},
    {"BextTapeTrimmed", "sTAPE=  R12  \r\n", "", "", "R12"},
    {"BlankBextTapeIsNoTape", "sTAPE=   \r\n", "", "", std::nullopt},
    {"SceneMakesTapeFromNameAndDate", "sSCENE=4\r\n", "2016:03:07", "", "a.wav:2016-03-07"},
    {"UbitsAloneMakesTapeToo", "sUBITS=01020304\r\n", "2016/03/07", "", "a.wav:2016-03-07"},
    {"NoProductionMetadataNoTape", "sNOTE=x\r\n", "2016-03-07", "", std::nullopt},
    {"NoDateNoTape", "sSCENE=4\r\n", "", "", std::nullopt},
    // A date too short for a separator at index 4 is kept as it stands.
    {"ShortDateKept", "sTAKE=1\r\n", "2016", "", "a.wav:2016"},
};
INSTANTIATE_TEST_SUITE_P(Sources, TapeRules, ::testing::ValuesIn(kTapeCases),
                         [](const auto& info) { return std::string(info.param.name); });

using MovieName = ClipFixture;
using CircledTake = ClipFixture;
using DigitizerRate = ClipFixture;
using ShootDate = ClipFixture;

TEST_F(MovieName, JoinsSceneAndTakeElseTakesTheFileName) {
    EXPECT_EQ(LoadFile(FileOf("sSCENE=12\r\nsTAKE=3\r\n", "")).GetMovieName(), "12/3");
    EXPECT_EQ(LoadFile(FileOf("sTAKE=3\r\n", "")).GetMovieName(), "/3");
    EXPECT_EQ(LoadFile(FileOf("sSCENE=12\r\n", "")).GetMovieName(), "12");
    EXPECT_EQ(LoadFile(FileOf("-", ""), "Take 7.wav").GetMovieName(), "Take 7.wav");
}

TEST_F(CircledTake, ComesFromIxmlThenOnlyTheExactBextWords) {
    const struct {
        std::string keywords, ixmlBody;
        std::optional<bool> circled;
    } cases[] = {{"sCIRCLED=FALSE\r\n", "<CIRCLED>TRUE</CIRCLED>", true},
                 {"sCIRCLED=TRUE\r\n", "", true},
                 {"sCIRCLED=FALSE\r\n", "", false},
                 {"sCIRCLED=true\r\n", "", std::nullopt},
                 {"-", "", std::nullopt}};
    for (const auto& c : cases) {
        const Movie movie = LoadFile(FileOf(c.keywords, c.ixmlBody));
        EXPECT_EQ(movie.HasMovieCircled() ? std::optional<bool>(movie.GetMovieCircled()) : std::nullopt, c.circled)
            << c.keywords << c.ixmlBody;
    }
}

TEST_F(DigitizerRate, MarksPulledRecordings) {
    const struct {
        std::string speed;
        bool has;
        uint32_t rate;
        bool use;
    } cases[] = {
        {"<DIGITIZER_SAMPLE_RATE>48048</DIGITIZER_SAMPLE_RATE>", true, 48048, true},
        {"<DIGITIZER_SAMPLE_RATE>48000</DIGITIZER_SAMPLE_RATE>", true, 48000, false},
        // A rate of 0 is no rate, yet differs from the file's.
        {"<DIGITIZER_SAMPLE_RATE>0</DIGITIZER_SAMPLE_RATE>", false, 0, true},
        {"<TIMECODE_RATE>25/1</TIMECODE_RATE>", false, 0, false},
    };
    for (const auto& c : cases) {
        const Movie movie = LoadFile(FileOf("-", "<SPEED>" + c.speed + "</SPEED>"));
        EXPECT_EQ(movie.HasMovieDigitizerRate(), c.has) << c.speed;
        EXPECT_EQ(movie.GetMovieDigitizerRate(), c.rate) << c.speed;
        EXPECT_EQ(movie.UseDigitizerRate(), c.use) << c.speed;
    }
}

TEST_F(ShootDate, TakesBextPartsAndTheFileTimeForWhatIsMissing) {
    ClipFile file = FileOf("sSCENE=1\r\n", "");
    file.bext->originationDate = "2024:05:17";
    file.bext->originationTime = "13:45:10";
    Movie movie = LoadFile(file);
    EXPECT_TRUE(movie.HasMovieShootDate());
    EXPECT_EQ(movie.GetMovieShootDate(), "2024-05-17 13:45:10");

    // Without a `bext` time the file system gives one: plain decimals, no
    // leading zeros, three fields.
    file.bext->originationTime = "";
    movie = LoadFile(file);
    const std::string shootDate = movie.GetMovieShootDate();
    ASSERT_EQ(shootDate.rfind("2024-05-17 ", 0), 0u) << shootDate;
    int h = -1, m = -1, s = -1;
    ASSERT_EQ(std::sscanf(shootDate.c_str() + 11, "%d:%d:%d", &h, &m, &s), 3) << shootDate;
    EXPECT_TRUE(h >= 0 && h < 24 && m >= 0 && m < 60 && s >= 0 && s < 61) << shootDate;
}

}  // namespace
