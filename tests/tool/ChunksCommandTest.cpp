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

TEST(ChunksCommand, GoodFileAsJson) {
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
    std::string umidHex;
    for (int i = 0; i < 64; ++i) umidHex += "01";
    EXPECT_EQ(json["bext"]["umid"], umidHex);
    EXPECT_EQ(json["umid"]["hex"], std::string(46, '0') + "09");
    EXPECT_EQ(json["umid"]["valid"], true);
}

// A failed stream answers nothing but its error; a good one without data has
// no samples to tell of.
TEST(ChunksCommand, GivesNullsForWhatTheStreamCannotSay) {
    const struct {
        std::string bytes;
        int status;
        nlohmann::json error;
        std::vector<const char*> nulls;
    } rows[] = {
        {AudioFileWriter::Wave().Chunk("data", "").Bytes(),
         1,
         "Malformed WAVE file with 'DATA' before 'fmt '",
         {"channels", "sampleRate", "bitsPerSample", "floatingPoint", "sampleCount", "sampleSize", "startPosition",
          "dataWrongEndian"}},
        {AudioFileWriter::Wave().Chunk("fmt ", Payload::FmtChunk(Payload::Fmt())).Bytes(),
         0,
         nullptr,
         {"sampleCount", "startPosition"}},
    };
    for (const auto& row : rows) {
        TempFile file(row.bytes);
        const ToolOutcome outcome = RunOrlo("chunks --json " + file.Path());
        EXPECT_EQ(outcome.status, row.status);
        const auto json = nlohmann::json::parse(outcome.out);
        EXPECT_EQ(json["error"], row.error);
        for (const char* key : row.nulls) EXPECT_TRUE(json[key].is_null()) << key;
        if (row.status == 0) {
            EXPECT_EQ(json["channels"], 2);
        }
    }
}

TEST(ChunksCommand, TextNamesTheErrorAndUsageErrorsExit2) {
    const ToolOutcome missing = RunOrlo("chunks /nonexistent/take.wav");
    EXPECT_EQ(missing.status, 1);
    EXPECT_NE(missing.out.find("error: File could not be opened"), std::string::npos) << missing.out;
    EXPECT_EQ(RunOrlo("chunks").status, 2);
    EXPECT_EQ(RunOrlo("chunks --no-such-flag x").status, 2);
}

}  // namespace
