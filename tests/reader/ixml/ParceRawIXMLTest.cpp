// iXML documents in the shapes that recorders write them, and broken ones.
#include <gtest/gtest.h>

#include <string>

#include "ReaderTest.h"
#include "reader/ixml/IXMLTextParsers.h"
#include "reader/ixml/ParceRawIXML.h"

namespace {

using namespace Chunks::IXML;

std::string Text(const ZEB::ZEBString& s) { return UTF8Text(s); }

// A current production recorder: every section the reader looks at, and
// some that it does not.
const char* const kVersion2 = R"(<?xml version="1.0" encoding="UTF-8"?>
<BWFXML>
  <IXML_VERSION>2.10</IXML_VERSION>
  <PROJECT>Night Shoot</PROJECT>
  <SCENE>42A</SCENE>
  <TAKE>3</TAKE>
  <TAPE>DAY07</TAPE>
  <CIRCLED>TRUE</CIRCLED>
  <FILE_UID>RCD2024051713451000000001</FILE_UID>
  <UBITS>17052400</UBITS>
  <NOTE>plane overhead at the end</NOTE>
  <NO_GOOD>FALSE</NO_GOOD>
  <FALSE_START>FALSE</FALSE_START>
  <WILD_TRACK>TRUE</WILD_TRACK>
  <USER>Boom op: Sam</USER>
  <SPEED>
    <NOTE>camera at 23.976</NOTE>
    <TIMECODE_RATE>24000/1001</TIMECODE_RATE>
    <TIMECODE_FLAG>NDF</TIMECODE_FLAG>
    <DIGITIZER_SAMPLE_RATE>48048</DIGITIZER_SAMPLE_RATE>
    <TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_HI>1</TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_HI>
    <TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_LO>640000</TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_LO>
    <TIMESTAMP_SAMPLE_RATE>48000</TIMESTAMP_SAMPLE_RATE>
  </SPEED>
  <TRACK_LIST>
    <TRACK_COUNT>2</TRACK_COUNT>
    <TRACK>
      <CHANNEL_INDEX>1</CHANNEL_INDEX>
      <INTERLEAVE_INDEX>1</INTERLEAVE_INDEX>
      <NAME>Boom</NAME>
    </TRACK>
    <TRACK>
      <CHANNEL_INDEX>2</CHANNEL_INDEX>
      <INTERLEAVE_INDEX>2</INTERLEAVE_INDEX>
      <NAME>Lav Ünal</NAME>
    </TRACK>
  </TRACK_LIST>
  <HISTORY><ORIGINAL_FILENAME>42A_03.WAV</ORIGINAL_FILENAME></HISTORY>
</BWFXML>)";

class IxmlDocument : public ReaderFixture {
protected:
    TOVRESULT Parse(const std::string& xml) { return ParceRawIXML(xml, host.Get(), data); }
    IXMLData data;
};

TEST_F(IxmlDocument, ACurrentRecordersDocument) {
    ASSERT_EQ(Parse(kVersion2), TOV_OK);
    EXPECT_TRUE(data.parsed);
    ASSERT_TRUE(data.HasVersion());
    EXPECT_DOUBLE_EQ(data.GetVersion(), 2.1);
    const struct {
        bool has;
        std::string value;
        const char* expected;
    } texts[] = {
        {data.HasProject(), Text(data.GetProject()), "Night Shoot"},
        {data.HasScene(), Text(data.GetScene()), "42A"},
        {data.HasTake(), Text(data.GetTake()), "3"},
        {data.HasTape(), Text(data.GetTape()), "DAY07"},
        {data.HasFileUID(), Text(data.GetFileUID()), "RCD2024051713451000000001"},
        {data.HasUBITS(), Text(data.GetUBITS()), "17052400"},
        {data.HasNotes(), Text(data.GetNotes()), "plane overhead at the end"},
        {data.HasUser(), Text(data.GetUser()), "Boom op: Sam"},
    };
    for (const auto& t : texts) {
        EXPECT_TRUE(t.has) << t.expected;
        EXPECT_EQ(t.value, t.expected);
    }
    EXPECT_TRUE(data.HasCircled() && data.GetCircled());
    EXPECT_TRUE(data.HasNoGood() && !data.GetNoGood());
    EXPECT_TRUE(data.HasFalseStart() && !data.GetFalseStart());
    EXPECT_TRUE(data.HasWildTrack() && data.GetWildTrack());

    ASSERT_TRUE(data.HasSpeed());
    const IXMLSpeed speed = data.GetSpeed();
    EXPECT_TRUE(speed.IsPresent());
    ASSERT_TRUE(speed.HasTimeCodeRate());
    EXPECT_EQ(speed.GetTimeCodeRate().numerator, 24000);
    EXPECT_EQ(speed.GetTimeCodeRate().denominator, 1001);
    EXPECT_TRUE(speed.HasTimeCodeFlag() && !speed.GetTimeCodeFlag());
    EXPECT_TRUE(speed.HasSamplesSinceMidnight());
    EXPECT_EQ(speed.GetSamplesSinceMidnight(), (1ull << 32) + 640000);
    EXPECT_TRUE(speed.HasDigitizerSampleRate());
    EXPECT_EQ(speed.GetDigitizerSampleRate(), 48048u);
    EXPECT_EQ(speed.GetTimeStampSampleRate(), 48000u);

    ASSERT_TRUE(data.HasTracksCount());
    EXPECT_EQ(data.GetTracksCount(), 2);
    ASSERT_TRUE(data.HasTracksList());
    const std::vector<IXMLTrack> tracks = data.GetTracksList();
    ASSERT_EQ(tracks.size(), 2u);
    EXPECT_EQ(Text(tracks[1].GetName()), "Lav Ünal");
    EXPECT_EQ(tracks[1].GetChannelIndex(), 2);
    EXPECT_EQ(tracks[1].GetInterleaveIndex(), 2);
}

TEST_F(IxmlDocument, ValuesThatCountAsAbsent) {
    ASSERT_EQ(Parse("<BWFXML><SCENE></SCENE><TAKE/><CIRCLED>true</CIRCLED><NO_GOOD>YES</NO_GOOD>"
                    "<IXML_VERSION>new</IXML_VERSION><SPEED><NOTE>n</NOTE></SPEED></BWFXML>"),
              TOV_OK);
    EXPECT_FALSE(data.HasScene());
    EXPECT_FALSE(data.HasTake());
    EXPECT_FALSE(data.HasCircled()) << "only the exact capitals count";
    EXPECT_FALSE(data.HasNoGood());
    EXPECT_FALSE(data.HasVersion());
    EXPECT_FALSE(data.HasTracksCount()) << "no list, no count";
    EXPECT_FALSE(data.HasNotes()) << "a NOTE inside SPEED is not the root's";
    ASSERT_TRUE(data.HasSpeed()) << "an element with nothing usable still counts";
    EXPECT_TRUE(data.GetSpeed().IsPresent());
    EXPECT_FALSE(data.GetSpeed().HasTimeCodeRate());
}

TEST_F(IxmlDocument, SpeedVariants) {
    const struct {
        const char* speed;
        bool hasRate, hasFlag, drop, hasSamples;
    } cases[] = {
        {"<TIMECODE_RATE>30000/1001</TIMECODE_RATE><TIMECODE_FLAG>DF</TIMECODE_FLAG>", true, true, true, false},
        {"<TIMECODE_RATE>25</TIMECODE_RATE><TIMECODE_FLAG>ndf</TIMECODE_FLAG>", false, false, false, false},
        {"<TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_LO>48000</TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_LO>", false, false, false,
         false},
        {"<TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_HI>0</TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_HI>"
         "<TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_LO>48000</TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_LO>",
         false, false, false, true},
    };
    for (const auto& c : cases) {
        IXMLData one;
        ASSERT_EQ(ParceRawIXML(std::string("<BWFXML><SPEED>") + c.speed + "</SPEED></BWFXML>", host.Get(), one), TOV_OK)
            << c.speed;
        const IXMLSpeed speed = one.GetSpeed();
        EXPECT_EQ(speed.HasTimeCodeRate(), c.hasRate) << c.speed;
        EXPECT_EQ(speed.HasTimeCodeFlag(), c.hasFlag) << c.speed;
        EXPECT_EQ(speed.GetTimeCodeFlag(), c.drop) << c.speed;
        EXPECT_EQ(speed.HasSamplesSinceMidnight(), c.hasSamples) << c.speed;
        if (!c.hasRate) {
            EXPECT_EQ(speed.GetTimeCodeRate().numerator, 0) << c.speed;
        }
    }
}

TEST_F(IxmlDocument, TrackListShapes) {
    const struct {
        const char* list;
        bool hasList;
        size_t tracks;
        int count;  // -1: none
    } rows[] = {
        // Any child makes the list present.
        {"<TRACK_LIST><TRACK_COUNT>4</TRACK_COUNT></TRACK_LIST>", true, 0, 4},
        // Every TRACK is kept, whatever it holds; the last one here has nothing usable.
        {"<TRACK_LIST><TRACK/><OTHER/><TRACK><CHANNEL_INDEX>x</CHANNEL_INDEX><NAME></NAME></TRACK>"
         "<TRACK_COUNT>many</TRACK_COUNT></TRACK_LIST>",
         true, 2, -1},
        {"<TRACK_LIST/>", false, 0, -1},
    };
    for (const auto& row : rows) {
        SCOPED_TRACE(row.list);
        IXMLData one;
        ASSERT_EQ(ParceRawIXML(std::string("<BWFXML>") + row.list + "</BWFXML>", host.Get(), one), TOV_OK);
        EXPECT_EQ(one.HasTracksList(), row.hasList);
        ASSERT_EQ(one.GetTracksList().size(), row.tracks);
        EXPECT_EQ(one.HasTracksCount() ? one.GetTracksCount() : -1, row.count);
        EXPECT_FALSE(one.HasSpeed());
        if (row.tracks == 0) continue;
        const IXMLTrack& last = one.GetTracksList().back();
        EXPECT_FALSE(last.HasChannelIndex());
        EXPECT_FALSE(last.HasInterleaveIndex());
        EXPECT_FALSE(last.HasName());
    }
}

TEST_F(IxmlDocument, BrokenTextLeavesTheDataUnparsed) {
    const struct {
        const char* name;
        std::string xml;
    } cases[] = {
        {"unclosed", "<BWFXML><SCENE>1</SCENE>"},
        {"misspelled declaration left as written", "<?xml version=\"1.0\" encording=\"UTF-8\"?><BWFXML/>"},
        {"zero byte inside the root", std::string("<BWFXML><SCENE>1\0</SCENE></BWFXML>", 33)},
        {"not XML", "RIFF"},
        {"empty", ""},
    };
    for (const auto& c : cases) {
        IXMLData one;
        EXPECT_LT(ParceRawIXML(c.xml, host.Get(), one), 0) << c.name;
        EXPECT_FALSE(one.parsed) << c.name;
    }
}

TEST_F(IxmlDocument, AZeroByteEndsTheText) {
    ASSERT_EQ(Parse(std::string("<BWFXML><SCENE>9</SCENE></BWFXML>\0<junk", 39)), TOV_OK);
    EXPECT_EQ(Text(data.GetScene()), "9");
}

TEST_F(IxmlDocument, WithoutAFactoryNothingIsRead) {
    EXPECT_EQ(ParceRawIXML("<BWFXML/>", nullptr, data), ZEB_E_NOTREADY);
    EXPECT_FALSE(data.parsed);
}

}  // namespace
