// `orlo probe` run as a person runs it: the example take against its golden
// JSON, toggles and the grouping setting reaching the plug-in, usage errors,
// and a file the plug-in cannot read.
#include <gtest/gtest.h>

#include <nlohmann/json.hpp>
#include <sstream>
#include <string>

#include "ExampleTake.h"
#include "GoldenDump.h"
#include "RunTool.h"
#include "TempFile.h"
#include "boundary/OrloConstants.h"

namespace {

using Json = nlohmann::ordered_json;

const std::string kExample = std::string(ORLO_EXAMPLES_DIR) + "/" + ExampleTake::kFileName;

ToolOutcome Probe(const std::string& arguments) { return RunTool(ORLO_TOOL, "probe " + arguments); }

// What the tool writes to stderr alone, console lines other than failures left out.
std::string ProbeStderr(const std::string& arguments) {
    return RunTool("sh", "-c '" + std::string(ORLO_TOOL) + " -q probe " + arguments + " 2>&1 >/dev/null'").out;
}

Json ProbeJson(const std::string& arguments, int status = 0) {
    const ToolOutcome outcome = Probe("--json " + arguments);
    EXPECT_EQ(outcome.status, status) << arguments << "\n" << outcome.out;
    return Json::parse(outcome.out);
}

std::string Toggle(const char* path, int value) {
    return std::string("--toggle ") + path + "=" + std::to_string(value);
}

std::string Hex(const std::string& bytes) {
    static const char digits[] = "0123456789ABCDEF";
    std::string out;
    for (unsigned char c : bytes) {
        out += digits[c >> 4];
        out += digits[c & 0x0F];
    }
    return out;
}

TEST(ProbeCommand, ExampleTakeMatchesGolden) {
    Json report = ProbeJson(kExample);
    // The path as given is the only thing that depends on the machine.
    ASSERT_EQ(report["file"], kExample);
    report["file"] = ExampleTake::kFileName;
    aaftest::ExpectMatchesGolden(report.dump(2) + "\n", std::string(TOOL_GOLDEN_DIR) + "/probe-12A-T03.json");
}

// Toggles choose where the Mob ID comes from, and the grouping setting reaches
// the plug-in unless a toggle has it make no settings object.
TEST(ProbeCommand, TogglesAndTheGroupingSettingReachThePlugin) {
    const std::string umid = ExampleTake::BextPayload().substr(348, 32);
    const struct {
        std::string arguments;
        const char* key;
        Json value;
    } cases[] = {
        // The bext UMID with its material fields (Data1, Data2, Data3) turned into the machine's order.
        {"", "mobID", Hex(umid.substr(0, 16)) + "117C2B5E034AEF11" + Hex(umid.substr(24, 8))},
        {Toggle(toggle_BigEndianSmpteIdInBEXTData, 1), "mobID", Hex(umid)},
        // The iXML FILE_UID's first 32 characters taken as bytes.
        {Toggle(toggle_MobIDFromiXML, 7), "mobID", Hex("ORL12A0003D20240517T134510A1B2C3")},
        {"", "groupingAllowed", true},
        {"--no-autodetect-groups", "groupingAllowed", false},
        {"--no-autodetect-groups " + Toggle(toggle_IgnoreHostSettingsForUnitTest, 1), "groupingAllowed", true},
    };
    for (const auto& c : cases) EXPECT_EQ(ProbeJson(c.arguments + " " + kExample)[c.key], c.value) << c.arguments;
}

TEST(ProbeCommand, UsageErrorsExit2AndSayWhy) {
    const struct {
        std::string arguments;
        const char* message;
    } cases[] = {
        {"--toggle /OrloReaderMovMediaContainer/Nope=1 " + kExample, "is not a toggle of the plug-in"},
        {"--toggle", "--toggle"},
        {"", "FILE"},
        {"--no-such-flag " + kExample, "--no-such-flag"},
    };
    for (const auto& c : cases) {
        EXPECT_EQ(Probe(c.arguments).status, 2) << c.arguments;
        const std::string error = ProbeStderr(c.arguments);
        EXPECT_NE(error.find(c.message), std::string::npos) << c.arguments << " gave: " << error;
    }
}

TEST(ProbeCommand, FileThePluginCannotReadFailsWithItsCodeAndReason) {
    TempFile text("This is a shot list, not a recording.\n");
    const Json report = ProbeJson(text.Path(), 1);
    EXPECT_EQ(report["result"], "0x8000FFFF");
    EXPECT_TRUE(report["reason"].is_string()) << report.dump(2);
    EXPECT_FALSE(report.contains("mobID"));

    const ToolOutcome plain = Probe(text.Path());
    EXPECT_EQ(plain.status, 1);
    EXPECT_EQ(plain.out, "");
    const std::string error = ProbeStderr(text.Path());
    EXPECT_EQ(error.find('\n'), error.size() - 1) << error;
    EXPECT_NE(error.find(text.Path() + ": the plug-in made no clip of it (0x8000FFFF): "), std::string::npos) << error;

    EXPECT_EQ(Probe("/nonexistent/take.wav").status, 1);
}

TEST(ProbeCommand, TextShowsAlignedClipLinesAndATrackTable) {
    const ToolOutcome outcome = Probe(kExample);
    ASSERT_EQ(outcome.status, 0);
    std::istringstream lines(outcome.out);
    std::string line;
    std::getline(lines, line);
    EXPECT_EQ(line, "Clip");
    size_t valueColumn = std::string::npos;
    int clipLines = 0;
    while (std::getline(lines, line) && line != "Tracks") {
        const size_t column = line.find_first_not_of(' ', line.find("  ", 2));
        if (valueColumn == std::string::npos) valueColumn = column;
        EXPECT_EQ(column, valueColumn) << line;
        ++clipLines;
    }
    EXPECT_NE(outcome.out.find(" 01:00:00:00 at 25 fps, frame 90000\n"), std::string::npos);
    EXPECT_NE(outcome.out.find(" TRK1=Boom  TRK2=Lav\n"), std::string::npos);
    EXPECT_GT(clipLines, 25);
    ASSERT_EQ(line, "Tracks");
    int rows = 0;
    while (std::getline(lines, line)) ++rows;
    EXPECT_EQ(rows, 4);  // the header, the timecode track and two audio tracks
}

}  // namespace
