// `orlo link` and `orlo read` run as a person runs them: the module loaded
// from beside the tool, the example take linked to the same clip that
// `orlo clip` makes, and samples read back through the map as stored.
#include <gtest/gtest.h>

#include <fstream>
#include <nlohmann/json.hpp>
#include <sstream>
#include <string>

#include "AudioFileWriter.h"
#include "ChunkPayloads.h"
#include "ExampleTake.h"
#include "RunTool.h"
#include "TempFile.h"
#include "identity/IDText.h"
#include "tov/host/CryptoLibrary.h"

namespace {

using Json = nlohmann::ordered_json;

std::string Md5(const std::string& bytes) {
    unsigned char value[EVP_MAX_MD_SIZE];
    unsigned int length = 0;
    const CryptoLibrary* crypto = CryptoLibrary::Get();
    EVP_MD_CTX* digest = crypto->MD_CTX_new();
    crypto->DigestInit_ex(digest, crypto->md5(), nullptr);
    crypto->DigestUpdate(digest, bytes.data(), bytes.size());
    crypto->DigestFinal_ex(digest, value, &length);
    crypto->MD_CTX_free(digest);
    return ZEB::HexText(value, length, ZEB::HexCase::Lower);
}

std::string ReadFile(const std::string& path) {
    std::ifstream in(path, std::ios::binary);
    std::ostringstream bytes;
    bytes << in.rdbuf();
    return bytes.str();
}

TEST(LinkCommand, ExampleTakeLinksToTheClipOfOrloClipAndMapsItsFrames) {
    const std::string inRepository = "cd " + std::string(ORLO_EXAMPLES_DIR) + "/.. && " + ORLO_TOOL;
    const std::string take = std::string(" --json --no-clock examples/") + ExampleTake::kFileName;
    const ToolOutcome linked = RunTool("sh", "-c '" + inRepository + " link" + take + "'");
    ASSERT_EQ(linked.status, 0);
    const Json report = Json::parse(linked.out);
    EXPECT_EQ(report["supported"], true);
    EXPECT_EQ(report["redirected"], false);
    EXPECT_EQ(report["capabilities"], "0x00004003");
    EXPECT_EQ(report["extensions"].size(), 7u);
    EXPECT_EQ(report["clips"]["count"], 1);
    const Json clip = Json::parse(ReadFile(std::string(TOOL_GOLDEN_DIR) + "/clip-12A-T03.json"));
    EXPECT_EQ(report["clips"]["aaf"], clip["aaf"]);

    const std::string file = ExampleTake::File();
    const uint64_t data = file.find("data") + 8;
    const Json& map = report["sampleMap"];
    EXPECT_EQ(map["channels"], 2);
    EXPECT_EQ(map["samples"], 48000);
    EXPECT_EQ(map["bytesPerFrame"], 6);
    EXPECT_EQ(map["firstPosition"], data);
    EXPECT_EQ(map["lastPosition"], data + 6 * 47999);
    EXPECT_EQ(map["contiguousBytes"], 6 * 48000);
}

TEST(LinkCommand, SaysWhatItCouldNotLink) {
    TempFile text("no chunks here\n");
    const ToolOutcome refused = RunTool(ORLO_TOOL, "link --json " + text.Path());
    EXPECT_EQ(refused.status, 1);
    EXPECT_EQ(Json::parse(refused.out)["supported"], false);
    // A module that is not there: nothing on stdout, a failure status.
    const ToolOutcome missing = RunTool(ORLO_TOOL, "link --module /nowhere/MSP_Orlo.so " + text.Path());
    EXPECT_EQ(missing.status, 1);
    EXPECT_TRUE(missing.out.empty());
}

struct ReadCase {
    const char* name;
    AudioFileWriter writer;
    std::string samples;  ///< as stored: two channels of `bytes` each a frame
    unsigned int bytes;
    bool bigEndian;
};

TEST(ReadCommand, ReadsSamplesAsStoredAndWritesAChannelAsLittleEndianWav) {
    std::string samples;
    for (int i = 0; i < 600; ++i) samples.push_back(static_cast<char>(i * 7 + i / 3));
    ReadCase cases[] = {
        {"WAVE 24-bit", AudioFileWriter::Wave(), samples, 3, false},
        {"AIFF 16-bit", AudioFileWriter::Aiff(), samples.substr(0, 400), 2, true},
        {"AIFF 24-bit", AudioFileWriter::Aiff(), samples, 3, true},
    };
    for (ReadCase& c : cases) {
        SCOPED_TRACE(c.name);
        const uint32_t frames = static_cast<uint32_t>(c.samples.size() / (2 * c.bytes));
        if (c.bigEndian) {
            Payload::Comm comm;
            comm.frames = frames;
            comm.bits = static_cast<uint16_t>(8 * c.bytes);
            c.writer.Chunk("COMM", Payload::CommChunk(comm)).Chunk("SSND", Payload::SsndChunk(0, c.samples));
        } else {
            Payload::Fmt fmt;
            fmt.bits = static_cast<uint16_t>(8 * c.bytes);
            c.writer.Chunk("fmt ", Payload::FmtChunk(fmt)).Chunk("data", c.samples);
        }
        TempFile file(c.writer.Bytes());
        const ToolOutcome md5 = RunTool(ORLO_TOOL, "read --md5 --json " + file.Path());
        ASSERT_EQ(md5.status, 0);
        EXPECT_EQ(Json::parse(md5.out)["md5"], Md5(c.samples));

        TempFile out("");
        ASSERT_EQ(RunTool(ORLO_TOOL, "read --channel 2 -o " + out.Path() + " " + file.Path()).status, 0);
        std::string expected;
        for (uint32_t f = 0; f < frames; ++f) {
            const std::string sample = c.samples.substr((2 * f + 1) * c.bytes, c.bytes);
            expected += c.bigEndian ? std::string(sample.rbegin(), sample.rend()) : sample;
        }
        const std::string wav = ReadFile(out.Path());
        ASSERT_GE(wav.size(), 44u);
        EXPECT_EQ(wav.substr(0, 4), "RIFF");
        EXPECT_EQ(wav.substr(44, expected.size()), expected);
    }
}

TEST(ReadCommand, RefusesAChannelTheFileHasNotAndAskingForNothing) {
    TempFile take(ExampleTake::File());
    EXPECT_EQ(RunTool(ORLO_TOOL, "read --md5 --channel 3 " + take.Path()).status, 1);
    EXPECT_EQ(RunTool(ORLO_TOOL, "read " + take.Path()).status, 2);
    TempFile text("no chunks here\n");
    EXPECT_EQ(RunTool(ORLO_TOOL, "read --md5 " + text.Path()).status, 1);
}

}  // namespace
