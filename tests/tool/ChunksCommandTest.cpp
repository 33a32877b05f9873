// `orlo chunks` run as a person runs it: output, nulls and exit status.
#include <gtest/gtest.h>

#include <cstdio>
#include <nlohmann/json.hpp>

#include "AudioFileWriter.h"
#include "Bytes.h"
#include "ChunkPayloads.h"
#include "RunTool.h"
#include "TempFile.h"

namespace {

// `orlo -q ARGUMENTS`, as a person runs it.
ToolOutcome RunOrlo(const std::string& arguments) { return RunTool(ORLO_TOOL, "-q " + arguments); }

std::string BroadcastWave() {
    Payload::Bext bext;
    bext.description = "sSCENE=12A\r\nsTAKE=3\r\n";
    bext.umid = std::string(64, '\x01');
    Payload::Fmt fmt;
    return AudioFileWriter::Wave()
        .Chunk("bext", Payload::BextChunk(bext))
        .Chunk("fmt ", Payload::FmtChunk(fmt))
        .Chunk("data", std::string(60, '\0'))
        .Chunk("umid", std::string(23, '\0') + "\x09")
        .Bytes();
}

TEST(ChunksCommandTest, GoodFileAsJson) {
    TempFile file(BroadcastWave());
    const ToolOutcome outcome = RunOrlo("chunks --json " + file.Path());
    ASSERT_EQ(outcome.status, 0) << outcome.out;
    const auto json = nlohmann::json::parse(outcome.out);
    EXPECT_TRUE(json["error"].is_null());
    EXPECT_EQ(json["chunks"], nlohmann::json({"fmt ", "data", "bext", "umid"}));
    EXPECT_EQ(json["channels"], 2);
    EXPECT_EQ(json["sampleCount"], 10);
    EXPECT_EQ(json["startPosition"], 12 + 610 + 24 + 8);
    EXPECT_EQ(json["bext"]["keywords"], nlohmann::json({{"SCENE", "12A"}, {"TAKE", "3"}}));
    EXPECT_EQ(json["bext"]["umid"], [] {
        std::string hex;
        for (int i = 0; i < 64; ++i) hex += "01";
        return hex;
    }());
    EXPECT_EQ(json["umid"]["hex"], std::string(46, '0') + "09");
    EXPECT_EQ(json["umid"]["valid"], true);
}

TEST(ChunksCommandTest, FailedStreamGivesItsErrorAndNulls) {
    TempFile file(AudioFileWriter::Wave().Chunk("data", "").Bytes());
    const ToolOutcome outcome = RunOrlo("chunks --json " + file.Path());
    EXPECT_EQ(outcome.status, 1);
    const auto json = nlohmann::json::parse(outcome.out);
    EXPECT_EQ(json["error"], "Malformed WAVE file with 'DATA' before 'fmt '");
    for (const char* key : {"channels", "sampleRate", "bitsPerSample", "floatingPoint", "sampleCount", "sampleSize",
                            "startPosition", "dataWrongEndian"})
        EXPECT_TRUE(json[key].is_null()) << key;
}

TEST(ChunksCommandTest, GoodStreamWithoutDataHasNullSamples) {
    TempFile file(AudioFileWriter::Wave().Chunk("fmt ", Payload::FmtChunk(Payload::Fmt())).Bytes());
    const ToolOutcome outcome = RunOrlo("chunks --json " + file.Path());
    EXPECT_EQ(outcome.status, 0);
    const auto json = nlohmann::json::parse(outcome.out);
    EXPECT_EQ(json["channels"], 2);
    EXPECT_TRUE(json["sampleCount"].is_null());
    EXPECT_TRUE(json["startPosition"].is_null());
}

TEST(ChunksCommandTest, TextNamesTheErrorAndUsageErrorsExit2) {
    const ToolOutcome missing = RunOrlo("chunks /nonexistent/take.wav");
    EXPECT_EQ(missing.status, 1);
    EXPECT_NE(missing.out.find("error: File could not be opened"), std::string::npos) << missing.out;
    EXPECT_EQ(RunOrlo("chunks").status, 2);
    EXPECT_EQ(RunOrlo("chunks --no-such-flag x").status, 2);
}

}  // namespace
