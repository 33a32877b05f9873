// `orlo clip` run as a person runs it: the example take's clip against its
// golden JSON, and where a failure stopped the build.
#include <gtest/gtest.h>
#include <unistd.h>

#include <filesystem>
#include <nlohmann/json.hpp>
#include <string>

#include "ExampleTake.h"
#include "GoldenDump.h"
#include "RunTool.h"
#include "TempFile.h"

namespace {

using Json = nlohmann::ordered_json;

const std::string kExample = std::string(ORLO_EXAMPLES_DIR) + "/" + ExampleTake::kFileName;

TEST(ClipCommand, ExampleTakeMatchesGolden) {
    // Run from the repository as the README shows it, so that the path, and
    // the URL that the locators make of it, are the same on every machine.
    const std::string inRepository = "cd " + std::string(ORLO_EXAMPLES_DIR) + "/.. && " + ORLO_TOOL + " clip ";
    const ToolOutcome outcome =
        RunTool("sh", "-c '" + inRepository + "--json --no-clock examples/" + ExampleTake::kFileName + "'");
    ASSERT_EQ(outcome.status, 0);
    aaftest::ExpectMatchesGolden(outcome.out, std::string(TOOL_GOLDEN_DIR) + "/clip-12A-T03.json");

    const ToolOutcome text = RunTool(ORLO_TOOL, "clip --no-clock " + kExample);
    EXPECT_EQ(text.status, 0);
    EXPECT_NE(text.out.find("MasterMob"), std::string::npos) << text.out;
}

// A file the plug-in cannot read stops at the Movie; a tool whose AAF library
// is missing stops at the clip and says which library it could not load.
TEST(ClipCommand, FailuresNameTheirStage) {
    TempFile text("not audio at all");
    Json report = Json::parse(RunTool(ORLO_TOOL, "clip --json " + text.Path()).out);
    EXPECT_EQ(report["result"], "0x8000FFFF");
    EXPECT_EQ(report["stage"], "movie");
    EXPECT_TRUE(report["aaf"].is_null());

    const auto lonely = std::filesystem::temp_directory_path() / ("orlo-clip-" + std::to_string(::getpid()));
    std::filesystem::create_directories(lonely);
    std::filesystem::copy_file(ORLO_TOOL, lonely / "orlo", std::filesystem::copy_options::overwrite_existing);
    const std::string tool = (lonely / "orlo").string();
    report = Json::parse(RunTool(tool, "clip --json " + kExample).out);
    EXPECT_EQ(report["stage"], "aaf");
    EXPECT_EQ(report["result"], "0x80120400");
    const std::string error = RunTool("sh", "-c '" + tool + " -q clip " + kExample + " 2>&1 >/dev/null'").out;
    EXPECT_NE(error.find("libcom-api.so"), std::string::npos) << error;
    std::filesystem::remove_all(lonely);

    EXPECT_EQ(RunTool(ORLO_TOOL, "clip").status, 2);
    EXPECT_EQ(RunTool(ORLO_TOOL, "clip --frobnicate " + kExample).status, 2);
}

}  // namespace
