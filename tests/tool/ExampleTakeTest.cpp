// The committed example take is what its generator writes, and holds what the
// example promises: the keywords and the document fit their chunks.
#include <gtest/gtest.h>

#include <fstream>
#include <iterator>
#include <string>

#include "ExampleTake.h"

namespace {

std::string Committed() {
    std::ifstream in(std::string(ORLO_EXAMPLES_DIR) + "/" + ExampleTake::kFileName, std::ios::binary);
    return std::string(std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>());
}

TEST(ExampleTakeTest, CommittedFileIsWhatTheGeneratorWrites) {
    const std::string committed = Committed();
    ASSERT_FALSE(committed.empty()) << "examples/" << ExampleTake::kFileName << " is missing";
    EXPECT_TRUE(committed == ExampleTake::File()) << "regenerate it: make_example_take " << ORLO_EXAMPLES_DIR;
    EXPECT_LT(committed.size(), 400u * 1024);
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
