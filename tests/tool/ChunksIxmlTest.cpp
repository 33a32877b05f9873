// `orlo chunks --json` on a file with an iXML chunk: the values and their nulls.
#include <gtest/gtest.h>

#include <nlohmann/json.hpp>

#include "AudioFileWriter.h"
#include "ChunkPayloads.h"
#include "RunTool.h"
#include "TempFile.h"

namespace {

std::string WaveWithIxml(const std::string& xml) {
    return AudioFileWriter::Wave()
        .Chunk("fmt ", Payload::FmtChunk({}))
        .Chunk("iXML", xml)
        .Chunk("data", std::string(12, '\0'))
        .Bytes();
}

TEST(ChunksIxml, ParsedValuesAndNulls) {
    const std::string root =
        "<BWFXML><SCENE>42A</SCENE><CIRCLED>TRUE</CIRCLED><SPEED><TIMECODE_RATE>25/1</TIMECODE_RATE></SPEED>"
        "<TRACK_LIST><TRACK><NAME>Boom</NAME></TRACK></TRACK_LIST></BWFXML>";
    TempFile file(WaveWithIxml("<?xml version=\"1.0\" encording=\"UTF-8\"?>" + root + "\r\n"));
    const ToolOutcome outcome = RunTool(ORLO_TOOL, "-q chunks --json " + file.Path());
    ASSERT_EQ(outcome.status, 0) << outcome.out;
    const auto json = nlohmann::json::parse(outcome.out)["ixml"];
    EXPECT_EQ(json["raw"], "<?xml version=\"1.0\" encoding=\"UTF-8\"?>" + root);
    EXPECT_EQ(json["parsed"], true);
    EXPECT_EQ(json["result"], 0);
    EXPECT_EQ(json["scene"], "42A");
    EXPECT_EQ(json["circled"], true);
    EXPECT_TRUE(json["take"].is_null());
    EXPECT_TRUE(json["tracksCount"].is_null());
    EXPECT_EQ(json["tracks"][0]["name"], "Boom");
    EXPECT_TRUE(json["tracks"][0]["channelIndex"].is_null());
    EXPECT_EQ(json["speed"]["timecodeRate"], "25/1");
    EXPECT_TRUE(json["speed"]["timecodeDrop"].is_null());
}

TEST(ChunksIxml, UnparsableTextIsShownNotFatal) {
    TempFile file(WaveWithIxml("<BWFXML><SCENE>1</BWFXML>"));
    const ToolOutcome outcome = RunTool(ORLO_TOOL, "-q chunks --json " + file.Path());
    ASSERT_EQ(outcome.status, 0) << "the stream itself is good";
    const auto json = nlohmann::json::parse(outcome.out)["ixml"];
    EXPECT_EQ(json["parsed"], false);
    EXPECT_EQ(json["result"], "0x80000001");
    EXPECT_TRUE(json["scene"].is_null());
}

}  // namespace
