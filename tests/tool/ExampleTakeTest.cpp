// The committed example take and group are what their generator writes, and
// the take holds what it promises: the keywords and the document fit their
// chunks.
#include <gtest/gtest.h>

#include <fstream>
#include <iterator>
#include <string>
#include <utility>
#include <vector>

#include "ExampleGroup.h"
#include "ExampleTake.h"

namespace {

std::string Committed(const std::string& name) {
    std::ifstream in(std::string(ORLO_EXAMPLES_DIR) + "/" + name, std::ios::binary);
    return std::string(std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>());
}

TEST(ExampleTakeTest, CommittedFilesAreWhatTheGeneratorWrites) {
    std::vector<std::pair<std::string, std::string>> files = {{ExampleTake::kFileName, ExampleTake::File()}};
    for (int channel = 1; channel <= ExampleGroup::kChannels; ++channel)
        files.emplace_back(std::string(ExampleGroup::kFolder) + "/" + ExampleGroup::FileName(channel),
                           ExampleGroup::File(channel));
    for (const auto& [name, generated] : files) {
        const std::string committed = Committed(name);
        ASSERT_FALSE(committed.empty()) << "examples/" << name << " is missing";
        EXPECT_TRUE(committed == generated) << "regenerate it: make_example_take " << ORLO_EXAMPLES_DIR;
        EXPECT_LT(committed.size(), 400u * 1024);
    }
}

TEST(ExampleTakeTest, DescriptionFitsItsFieldAndPaddingKeepsTheDocument) {
    const std::string bext = ExampleTake::BextPayload();
    // The 256-byte Description would cut the last keyword silently.
    EXPECT_EQ(bext[255], '\0');
    EXPECT_NE(bext.find("sCIRCLED=TRUE\r\n"), std::string::npos);

    const std::string plain = ExampleTake::IxmlPayload();
    const std::string padded = ExampleTake::IxmlPayload(4096);
    EXPECT_EQ(padded.size(), 4096u);
    EXPECT_EQ(padded.substr(0, plain.size()), plain);
    EXPECT_EQ(ExampleTake::IxmlPayload(10), plain);
}

}  // namespace
