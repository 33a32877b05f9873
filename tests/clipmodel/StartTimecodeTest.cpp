// The frame rate and start timecode of a clip, from iXML, `bext` or the file,
// with the toggles that change the order, and what the console is told.
#include <string>

#include "ClipTest.h"
#include "boundary/ModuleGlobals.h"
#include "boundary/OrloConstants.h"
#include "clipmodel/AddTimeCodeFromMetadata.h"

namespace {

using OrloReader::Movie;

struct StartCase {
    const char* name;
    std::string keywords;  // "-" for no bext
    uint64_t timeReference;
    std::string originationTime;
    std::string ixmlBody;
    const char* toggle;  // switched on, or null
    std::string timecode;
    std::string rate;  // as "num/den"
    bool drop;
    std::string report;  // the console's line
    bool hasStartOffset;
};

std::string Text(const OrloReader::TimeCodeInfo& tc) {
    std::string text;
    tc.ToString(text);
    return text;
}

std::string RateText(const _aafRational_t& rate) {
    return std::to_string(rate.numerator) + "/" + std::to_string(rate.denominator);
}

class StartTimecode : public ClipTest, public ::testing::WithParamInterface<StartCase> {};

TEST_P(StartTimecode, ComesFromTheMostTrustedSource) {
    const StartCase& c = GetParam();
    if (c.toggle != nullptr) SetToggle(c.toggle, 1);
    ClipFile file;
    if (c.keywords != "-") {
        file.bext = BextWith(c.keywords);
        file.bext->timeReference = c.timeReference;
        file.bext->originationTime = c.originationTime;
    }
    if (!c.ixmlBody.empty()) file.ixml = Ixml(c.ixmlBody);
    const Movie movie = LoadFile(file);

    EXPECT_EQ(Text(movie.GetMovieTimeCode()), c.timecode);
    EXPECT_EQ(RateText(movie.GetFileFrameRate().GetRationalFramerate()), c.rate);
    EXPECT_EQ(movie.GetFileFrameRate().GetDropFrame(), c.drop);
    EXPECT_EQ(movie.GetMovieTimeCode().IsDropFrame(), c.drop);
    EXPECT_EQ(movie.HasMovieStartOffset(), c.hasStartOffset);
    EXPECT_TRUE(movie.HasMovieTimeCode());
    EXPECT_TRUE(movie.HasFileFrameRate());
    EXPECT_TRUE(movie.HasTapeMobEditRate());
    ASSERT_FALSE(host.Texts().empty());
    EXPECT_EQ(host.Texts().back(), c.report);

    // The timecode track comes first and carries the same start.
    ASSERT_GE(movie.GetTrackCount(), 1u);
    const auto media = movie.GetTrack(0)->GetMedia();
    EXPECT_EQ(media->GetType(), OrloReader::kMediaTypeTimecode);
    EXPECT_EQ(Text(media->GetStartTimeCode()), c.timecode);
    EXPECT_EQ(media->GetStartTimeCode().GetTotalFrames(), movie.GetMovieTimeCode().GetTotalFrames());
}

constexpr uint64_t kHourAt48k = 48000ull * 3600;

const StartCase kStartCases[] = {
    {"NothingGivesDefaults", "-", 0, "", "", nullptr, "00:00:00:00", "25/1", false,
     "File frame rate of 25.00 obtained from (No Source) applied to a start time set to zero as default", false},
    // The +1 sample of the conversion does not reach a further frame.
    {"BextTimeReferenceOfOneHour", "sSCENE=1\r\n", kHourAt48k, "", "", nullptr, "01:00:00:00", "25/1", false,
     "File frame rate of 25.00 obtained from (No Source) applied to a start time from BEXT samples since midnight",
     true},
    // With the toggle off, a time reference of 0 is taken as it stands.
    {"BextZeroTimeReferenceTakenAsIs", "sSCENE=1\r\n", 0, "10:00:00", "", nullptr, "00:00:00:00", "25/1", false,
     "File frame rate of 25.00 obtained from (No Source) applied to a start time from BEXT samples since midnight",
     true},
    {"BextOriginationTimeWithToggle", "sSCENE=1\r\n", 0, "10:00:00", "", toggle_StartTimeCodeFromBEXTOriginationDate,
     "10:00:00:00", "25/1", false,
     "File frame rate of 25.00 obtained from (No Source) applied to a start time from BEXT Origination Time", false},
    {"ToggleWithUnreadableTimeFallsToZero", "sSCENE=1\r\n", 0, "", "", toggle_StartTimeCodeFromBEXTOriginationDate,
     "00:00:00:00", "25/1", false,
     "File frame rate of 25.00 obtained from (No Source) applied to a start time set to zero as default", false},
    {"IxmlSamplesBeatBext", "sSCENE=1\r\n", 0, "",
     "<SPEED><TIMECODE_RATE>24/1</TIMECODE_RATE><TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_HI>0"
     "</TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_HI><TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_LO>172800000"
     "</TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_LO><TIMESTAMP_SAMPLE_RATE>48000</TIMESTAMP_SAMPLE_RATE></SPEED>",
     nullptr, "01:00:00:00", "24/1", false,
     "File frame rate of 24.00 obtained from iXML applied to a start time from iXML samples since midnight", true},
    // The time stamp rate, not the file's, turns samples into time.
    {"IxmlTimestampRateCounts", "-", 0, "",
     "<SPEED><TIMECODE_RATE>25/1</TIMECODE_RATE><TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_HI>0"
     "</TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_HI><TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_LO>96000"
     "</TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_LO><TIMESTAMP_SAMPLE_RATE>96000</TIMESTAMP_SAMPLE_RATE></SPEED>",
     nullptr, "00:00:01:00", "25/1", false,
     "File frame rate of 25.00 obtained from iXML applied to a start time from iXML samples since midnight", true},
    // Drop frame from iXML needs a TAPE as well.
    {"IxmlDropWithoutTapeIsNonDrop", "-", 0, "",
     "<SPEED><TIMECODE_RATE>30000/1001</TIMECODE_RATE><TIMECODE_FLAG>DF</TIMECODE_FLAG></SPEED>", nullptr,
     "00:00:00:00", "30000/1001", false,
     "File frame rate of 29.97 obtained from iXML applied to a start time set to zero as default", false},
    {"IxmlDropWithTape", "-", 0, "",
     "<TAPE>T1</TAPE><SPEED><TIMECODE_RATE>30000/1001</TIMECODE_RATE><TIMECODE_FLAG>DF</TIMECODE_FLAG></SPEED>",
     nullptr, "00;00;00;00", "30000/1001", true,
     "File frame rate of 29.97DF obtained from iXML applied to a start time set to zero as default", false},
    {"BextFramerateKeywordNonDrop", "sFRAMERATE=29.97ND\r\n", 0, "", "", nullptr, "00:00:00:00", "30000/1001", false,
     "File frame rate of 29.97 obtained from BEXT FRAMERATE keyword applied to a start time from BEXT samples since "
     "midnight",
     true},
    {"BextFramerateKeywordDrop", "sFRAMERATE=29.97DF\r\n", 0, "", "", nullptr, "00;00;00;00", "30000/1001", true,
     "File frame rate of 29.97DF obtained from BEXT FRAMERATE keyword applied to a start time from BEXT samples "
     "since midnight",
     true},
    {"BextSpeedKeyword", "sSPEED=025.000-ND\r\n", 0, "", "", nullptr, "00:00:00:00", "25/1", false,
     "File frame rate of 25.00 obtained from BEXT SPEED keyword applied to a start time from BEXT samples since "
     "midnight",
     true},
    {"FramerateKeywordBeatsSpeed", "sSPEED=24\r\nsFRAMERATE=30\r\n", 0, "", "", nullptr, "00:00:00:00", "30/1", false,
     "File frame rate of 30.00 obtained from BEXT FRAMERATE keyword applied to a start time from BEXT samples since "
     "midnight",
     true},
};
INSTANTIATE_TEST_SUITE_P(Sources, StartTimecode, ::testing::ValuesIn(kStartCases),
                         [](const auto& info) { return std::string(info.param.name); });

TEST_F(ClipTest, FileCreationTimeToggleGivesAStartWhenNothingElseDoes) {
    SetToggle(toggle_StartTimeCodeFromFileCreationTime, 1);
    const Movie movie = LoadFile(ClipFile{});
    EXPECT_EQ(host.Texts().back(),
              "File frame rate of 25.00 obtained from (No Source) applied to a start time from file creation time");
    EXPECT_FALSE(movie.HasMovieStartOffset());
    EXPECT_EQ(movie.GetMovieTimeCode().GetFrames(), 0);
}

TEST_F(ClipTest, FileTimeCodeOnlyWithATape) {
    ClipFile file;
    file.ixml = Ixml("<SPEED><TIMECODE_RATE>25/1</TIMECODE_RATE></SPEED>");
    EXPECT_FALSE(LoadFile(file).HasMovieFileTimeCode());
    file.ixml = Ixml("<TAPE>T1</TAPE><SPEED><TIMECODE_RATE>25/1</TIMECODE_RATE></SPEED>");
    const Movie movie = LoadFile(file);
    ASSERT_TRUE(movie.HasMovieFileTimeCode());
    EXPECT_EQ(movie.GetMovieFileTimeCode().GetTotalFrames(), movie.GetMovieTimeCode().GetTotalFrames());
    EXPECT_EQ(movie.GetMovieEditRate().numerator, 48000);
    EXPECT_EQ(movie.GetMovieEditRate().denominator, 1);
}

const char* const kMismatchIxml =
    "<SPEED><TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_HI>0</TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_HI>"
    "<TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_LO>48000</TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_LO>"
    "<TIMESTAMP_SAMPLE_RATE>48000</TIMESTAMP_SAMPLE_RATE></SPEED>";

TEST_F(ClipTest, DisagreeingTimeReferencesAreNotedAndIxmlWins) {
    ClipFile file;
    file.bext = BextWith("sSCENE=1\r\n");
    file.bext->timeReference = 96000;
    file.ixml = Ixml(kMismatchIxml);
    const Movie movie = LoadFile(file);
    const auto texts = host.Texts();
    ASSERT_EQ(texts.size(), 2u);
    EXPECT_EQ(texts[0], "Note: iXML time reference and BEXT time reference do not match.");
    EXPECT_EQ(host.Lines()[0].first, 2u);
    EXPECT_EQ(movie.GetMovieStartOffset(), 48000);
}

TEST_F(ClipTest, WithoutAConsoleOnlyTheMismatchNoteFailsTheClip) {
    g_pConsole->Release();
    g_pConsole = nullptr;
    ClipFile file;
    file.bext = BextWith("sSCENE=1\r\n");
    file.bext->timeReference = 96000;
    file.ixml = Ixml(kMismatchIxml);
    Movie failed;
    EXPECT_EQ(Load(Write("mismatch.wav", file.Bytes()), failed), TOV_E_POINTER);

    // Agreeing references need no note, and the missing report is no failure.
    file.bext->timeReference = 48000;
    Movie movie;
    EXPECT_EQ(Load(Write("agree.wav", file.Bytes()), movie), TOV_OK);
    EXPECT_TRUE(host.Texts().empty());
}

TEST(ChooseFrameRate, TakesNothingFromNullSources) {
    _aafRational_t rate{7, 7};
    bool drop = true;
    EXPECT_FALSE(OrloReader::ChooseFrameRateFromFileAttributes(nullptr, nullptr, true, rate, drop, nullptr));
    EXPECT_EQ(rate.numerator, 7);

    Chunks::IXML::IXMLSpeed speed;
    speed.SetTimeCodeRate({60000, 1001});
    speed.SetHasTimeCodeRate(true);
    speed.SetTimeCodeFlag(true);
    speed.SetHasTimeCodeFlag(true);
    const char* source = nullptr;
    EXPECT_TRUE(OrloReader::ChooseFrameRateFromFileAttributes(&speed, nullptr, true, rate, drop, &source));
    EXPECT_TRUE(drop);
    EXPECT_STREQ(source, "iXML");
    // 25 fps has no drop-frame count, whatever the flag says.
    speed.SetTimeCodeRate({25, 1});
    EXPECT_TRUE(OrloReader::ChooseFrameRateFromFileAttributes(&speed, nullptr, true, rate, drop, &source));
    EXPECT_FALSE(drop);
}

}  // namespace
