// The example group run as a person runs it: any member probed, made a clip
// of and linked through the module gives the group's one clip, and the
// numbered files taken alone give clips of their own.
#include <gtest/gtest.h>

#include <nlohmann/json.hpp>
#include <string>

#include "ExampleGroup.h"
#include "GoldenDump.h"
#include "RunTool.h"

namespace {

using Json = nlohmann::ordered_json;

const std::string kGroup = std::string(ORLO_EXAMPLES_DIR) + "/" + ExampleGroup::kFolder + "/";

// Run from the repository as the README shows it, so that the paths, and the
// URLs that the locators make of them, are the same on every machine.
ToolOutcome InRepository(const std::string& arguments) {
    return RunTool("sh", "-c 'cd " + std::string(ORLO_EXAMPLES_DIR) + "/.. && " + ORLO_TOOL + " " + arguments + "'");
}

Json Mobs(const Json& aaf) { return aaf["Content"]["Mobs"]; }

TEST(ExampleGroup, SecondMembersProbeAndClipMatchGolden) {
    const std::string member = std::string("examples/") + ExampleGroup::kFolder + "/" + ExampleGroup::FileName(2);
    for (const char* command : {"probe --json", "clip --json --no-clock"}) {
        const ToolOutcome outcome = InRepository(std::string(command) + " " + member);
        ASSERT_EQ(outcome.status, 0) << command;
        const std::string golden = std::string(command).substr(0, std::string(command).find(' ')) + "-14B-T02.json";
        aaftest::ExpectMatchesGolden(outcome.out, std::string(TOOL_GOLDEN_DIR) + "/" + golden);
    }
    // The text names every member beside its channel.
    const ToolOutcome text = InRepository("probe " + member);
    for (int channel = 1; channel <= ExampleGroup::kChannels; ++channel) {
        const std::string name = ExampleGroup::FileName(channel);
        const size_t row = text.out.find("\n  " + std::to_string(channel) + "  audio     " + std::to_string(channel));
        ASSERT_NE(row, std::string::npos) << text.out;
        EXPECT_EQ(text.out.substr(text.out.find('\n', row + 1) - name.size(), name.size()), name) << text.out;
    }
}

TEST(ExampleGroup, EveryMemberLinksAsTheGroupUnlessTheHostSaysNo) {
    std::string master;
    for (int channel = 1; channel <= ExampleGroup::kChannels; ++channel) {
        const std::string path = kGroup + ExampleGroup::FileName(channel);
        const ToolOutcome linked = RunTool(ORLO_TOOL, "link --json --no-clock " + path);
        ASSERT_EQ(linked.status, 0) << path << "\n" << linked.out;
        const Json mobs = Mobs(Json::parse(linked.out)["clips"]["aaf"]);
        // The Master Mob, a file Mob per member, the tape Mob.
        ASSERT_EQ(mobs.size(), 2u + ExampleGroup::kChannels) << path;
        if (master.empty()) master = mobs[0]["MobID"];
        EXPECT_EQ(mobs[0]["MobID"], master) << path;

        const Json alone = Json::parse(RunTool(ORLO_TOOL, "clip --json --no-clock --no-autodetect-groups " + path).out);
        EXPECT_EQ(Mobs(alone["aaf"]).size(), 3u) << path;
        EXPECT_NE(Mobs(alone["aaf"])[0]["MobID"], master) << path;
    }
}

}  // namespace
