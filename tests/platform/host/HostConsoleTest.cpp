// The console's formatting of wide formats with narrow UTF-8 arguments, and its level filter.
#include <gtest/gtest.h>

#include <string>

#include "TestHost.h"

namespace {

class HostConsoleTest : public ::testing::Test {
protected:
    std::string Only() {
        EXPECT_EQ(host.Lines().size(), 1u);
        return host.Lines().empty() ? std::string() : host.Lines().back().second;
    }
    TestHost host;
};

TEST_F(HostConsoleTest, WideFormatTakesUTF8Arguments) {
    ASSERT_EQ(host->Print(1, L"%s: bad chunk in %s(%d)\n", "Orlo Plug-In", "Grüße/Take 😀.wav", 42), TOV_OK);
    EXPECT_EQ(Only(), "Orlo Plug-In: bad chunk in Grüße/Take 😀.wav(42)");
}

TEST_F(HostConsoleTest, NumbersOfEveryWidthTheMessagesUse) {
    ASSERT_EQ(host->Print(8, L"%d %x %llu %lu", -7, 0xBEEFu, 5368709120ull, 4294967295ul), TOV_OK);
    EXPECT_EQ(Only(), "-7 beef 5368709120 4294967295");
}

TEST_F(HostConsoleTest, NarrowFormatAndWideArguments) {
    ASSERT_EQ(host->PrintNarrow(2, "rate %s is %.3f, %ls", "29.97", 29.97, L"né"), TOV_OK);
    EXPECT_EQ(Only(), "rate 29.97 is 29.970, né");
}

TEST_F(HostConsoleTest, WideTextOutsideTheBasicPlaneIsWritten) {
    ASSERT_EQ(host->Write(16, L"𝄞 clef"), TOV_OK);
    EXPECT_EQ(Only(), "𝄞 clef");
}

TEST_F(HostConsoleTest, LongMessagesAreNotCut) {
    const std::string name(5000, 'a');
    ASSERT_EQ(host->Print(1, L"[%s]", name.c_str()), TOV_OK);
    EXPECT_EQ(Only(), "[" + name + "]");
}

TEST_F(HostConsoleTest, MalformedUTF8ArgumentFailsWithoutOutput) {
    EXPECT_EQ(host->Print(1, L"%s", "\xC3\x28 broken"), TOV_E_INVALIDARG);
    EXPECT_TRUE(host.Lines().empty());
    EXPECT_EQ(host->Print(1, nullptr), TOV_E_INVALIDARG);
    EXPECT_EQ(host->Write(1, nullptr), TOV_E_INVALIDARG);
}

TEST_F(HostConsoleTest, VerbosityFiltersByLevelBit) {
    ASSERT_EQ(host->SetVerbosity(1 | 16), TOV_OK);
    EXPECT_EQ(host->GetVerbosity(), 17u);
    struct {
        uint32_t level;
        bool shown;
    } const cases[] = {{1, true}, {2, false}, {4, false}, {8, false}, {16, true}};
    for (const auto& c : cases) {
        host.ClearLines();
        ASSERT_EQ(host->Print(c.level, L"level %d", static_cast<int>(c.level)), TOV_OK);
        EXPECT_EQ(host.Lines().size(), c.shown ? 1u : 0u) << "level " << c.level;
        if (c.shown) {
            EXPECT_EQ(host.Lines()[0].first, c.level);
        }
    }
}

TEST(HostConsoleDefaults, TracesAreHiddenByDefault) {
    HostConsole console;
    EXPECT_TRUE(console.Shows(kTOVDebugLevelError));
    EXPECT_TRUE(console.Shows(kTOVDebugLevelStartup));
    EXPECT_FALSE(console.Shows(kTOVDebugLevelTrace));
}

}  // namespace
