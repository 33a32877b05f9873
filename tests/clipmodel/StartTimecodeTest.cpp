// The frame rate and start timecode of a clip, from iXML, `bext` or the file,
// with the toggles that change the order, and what the console is told.
#include <string>

#include "ClipTest.h"
#include "boundary/ModuleGlobals.h"
#include "boundary/OrloConstants.h"

namespace {

using OrloReader::Movie;

struct StartCase {
    const char* name;
    std::string keywords;  // "-" for no bext
    uint64_t timeReference;
    std::string originationTime, ixmlBody;
    const char* toggle;  // switched on, or null
    std::string timecode;
    std::string rate;  // as "num/den"
    bool drop;
    // The console's line: "File frame rate of <rate> obtained from <source> applied to a start time <start>".
    std::string reportRate, reportSource, reportStart;
    bool hasStartOffset;
};
void PrintTo(const StartCase& row, std::ostream* os) { *os << row.name; }

std::string Text(const OrloReader::TimeCodeInfo& tc) {
    std::string text;
    tc.ToString(text);
    return text;
}

std::string RateText(const _aafRational_t& rate) {
    return std::to_string(rate.numerator) + "/" + std::to_string(rate.denominator);
}

class StartTimecode : public ClipFixture, public ::testing::WithParamInterface<StartCase> {};

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
    ASSERT_FALSE(host.Texts().empty());
    EXPECT_EQ(host.Texts().back(), "File frame rate of " + c.reportRate + " obtained from " + c.reportSource +
                                       " applied to a start time " + c.reportStart);

    // The timecode track comes first and carries the same start.
    ASSERT_GE(movie.GetTrackCount(), 1u);
    const auto media = movie.GetTrack(0)->GetMedia();
    EXPECT_EQ(media->GetType(), OrloReader::kMediaTypeTimecode);
    EXPECT_EQ(Text(media->GetStartTimeCode()), c.timecode);
    EXPECT_EQ(media->GetStartTimeCode().GetTotalFrames(), movie.GetMovieTimeCode().GetTotalFrames());
}

// An iXML SPEED element with a rate, a drop flag and a time stamp, each left out when empty.
std::string Speed(const std::string& rate, const std::string& flag, const std::string& samples = "",
                  const std::string& sampleRate = "") {
    std::string body = "<SPEED>";
    if (!rate.empty()) body += "<TIMECODE_RATE>" + rate + "</TIMECODE_RATE>";
    if (!flag.empty()) body += "<TIMECODE_FLAG>" + flag + "</TIMECODE_FLAG>";
    if (!samples.empty()) {
        body +=
            "<TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_HI>0</TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_HI>"
            "<TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_LO>" +
            samples + "</TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_LO><TIMESTAMP_SAMPLE_RATE>" + sampleRate +
            "</TIMESTAMP_SAMPLE_RATE>";
    }
    return body + "</SPEED>";
}

constexpr uint64_t kHourAt48k = 48000ull * 3600;
const char* const kNone = "(No Source)";
const char* const kZero = "set to zero as default";
const char* const kBextSamples = "from BEXT samples since midnight";
const char* const kIxmlSamples = "from iXML samples since midnight";
const char* const kFramerate = "BEXT FRAMERATE keyword";
const char* const kOrigination = toggle_StartTimeCodeFromBEXTOriginationDate;

const StartCase kStartCases[] = {
    {"NothingGivesDefaults", "-", 0, "", "", nullptr, "00:00:00:00", "25/1", false, "25.00", kNone, kZero, false},
    // The +1 sample of the conversion does not reach a further frame.
    {"BextTimeReferenceOfOneHour", "sSCENE=1\r\n", kHourAt48k, "", "", nullptr, "01:00:00:00", "25/1", false, "25.00",
     kNone, kBextSamples, true},
    // With the toggle off, a time reference of 0 is taken as it stands.
    {"BextZeroTimeReferenceTakenAsIs", "sSCENE=1\r\n", 0, "10:00:00", "", nullptr, "00:00:00:00", "25/1", false,
     "25.00", kNone, kBextSamples, true},
    {"BextOriginationTimeWithToggle", "sSCENE=1\r\n", 0, "10:00:00", "", kOrigination, "10:00:00:00", "25/1", false,
     "25.00", kNone, "from BEXT Origination Time", false},
    {"ToggleWithUnreadableTimeFallsToZero", "sSCENE=1\r\n", 0, "", "", kOrigination, "00:00:00:00", "25/1", false,
     "25.00", kNone, kZero, false},
    {"IxmlSamplesBeatBext", "sSCENE=1\r\n", 0, "", Speed("24/1", "", "172800000", "48000"), nullptr, "01:00:00:00",
     "24/1", false, "24.00", "iXML", kIxmlSamples, true},
    // The time stamp rate, not the file's, turns samples into time.
    {"IxmlTimestampRateCounts", "-", 0, "", Speed("25/1", "", "96000", "96000"), nullptr, "00:00:01:00", "25/1", false,
     "25.00", "iXML", kIxmlSamples, true},
    // Drop frame from iXML needs a TAPE as well.
    {"IxmlDropWithoutTapeIsNonDrop", "-", 0, "", Speed("30000/1001", "DF"), nullptr, "00:00:00:00", "30000/1001", false,
     "29.97", "iXML", kZero, false},
    {"IxmlDropWithTape", "-", 0, "", "<TAPE>T1</TAPE>" + Speed("30000/1001", "DF"), nullptr, "00;00;00;00",
     "30000/1001", true, "29.97DF", "iXML", kZero, false},
    {"BextFramerateKeywordDrop", "sFRAMERATE=29.97DF\r\n", 0, "", "", nullptr, "00;00;00;00", "30000/1001", true,
     "29.97DF", kFramerate, kBextSamples, true},
    {"BextSpeedKeyword", "sSPEED=025.000-ND\r\n", 0, "", "", nullptr, "00:00:00:00", "25/1", false, "25.00",
     "BEXT SPEED keyword", kBextSamples, true},
    {"FramerateKeywordBeatsSpeed", "sSPEED=24\r\nsFRAMERATE=30\r\n", 0, "", "", nullptr, "00:00:00:00", "30/1", false,
     "30.00", kFramerate, kBextSamples, true},
};
INSTANTIATE_TEST_SUITE_P(Sources, StartTimecode, ::testing::ValuesIn(kStartCases),
                         [](const auto& info) { return std::string(info.param.name); });

TEST_F(StartTimecode, FileCreationTimeToggleGivesAStartWhenNothingElseDoes) {
    SetToggle(toggle_StartTimeCodeFromFileCreationTime, 1);
    const Movie movie = LoadFile(ClipFile{});
    EXPECT_EQ(host.Texts().back(),
              "File frame rate of 25.00 obtained from (No Source) applied to a start time from file creation time");
    EXPECT_FALSE(movie.HasMovieStartOffset());
    EXPECT_EQ(movie.GetMovieTimeCode().GetFrames(), 0);
}

TEST_F(StartTimecode, FileTimeCodeOnlyWithATape) {
    ClipFile file;
    file.ixml = Ixml(Speed("25/1", ""));
    EXPECT_FALSE(LoadFile(file).HasMovieFileTimeCode());
    file.ixml = Ixml("<TAPE>T1</TAPE>" + Speed("25/1", ""));
    const Movie movie = LoadFile(file);
    ASSERT_TRUE(movie.HasMovieFileTimeCode());
    EXPECT_EQ(movie.GetMovieFileTimeCode().GetTotalFrames(), movie.GetMovieTimeCode().GetTotalFrames());
    EXPECT_EQ(movie.GetMovieEditRate().numerator, 48000);
    EXPECT_EQ(movie.GetMovieEditRate().denominator, 1);
}

// iXML says one second, bext two: the clip takes iXML's and notes the
// mismatch, which is the only report whose failure fails the clip.
TEST_F(StartTimecode, DisagreeingTimeReferencesAreNotedAndIxmlWins) {
    ClipFile file;
    file.bext = BextWith("sSCENE=1\r\n");
    file.bext->timeReference = 96000;
    file.ixml = Ixml(Speed("", "", "48000", "48000"));
    const Movie movie = LoadFile(file);
    const auto texts = host.Texts();
    ASSERT_EQ(texts.size(), 2u);
    EXPECT_EQ(texts[0], "Note: iXML time reference and BEXT time reference do not match.");
    EXPECT_EQ(host.Lines()[0].first, 2u);
    EXPECT_EQ(movie.GetMovieStartOffset(), 48000);

    host.ClearLines();
    g_pConsole->Release();
    g_pConsole = nullptr;
    Movie failed;
    EXPECT_EQ(Load(Write("mismatch.wav", file.Bytes()), failed), TOV_E_POINTER);
    // Agreeing references need no note, and the missing report is no failure.
    file.bext->timeReference = 48000;
    Movie agreeing;
    EXPECT_EQ(Load(Write("agree.wav", file.Bytes()), agreeing), TOV_OK);
    EXPECT_TRUE(host.Texts().empty());
}

}  // namespace
