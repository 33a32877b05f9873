// The console's formatting of wide formats with narrow UTF-8 arguments, and its level filter.
#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <vector>

#include "TestHost.h"

namespace {

// Named after its subject; the console itself is ::HostConsole.
class HostConsole : public ::testing::Test {
protected:
    TestHost host;
};

TEST_F(HostConsole, FormatsWideAndNarrowFormatsToOneUTF8Line) {
    const std::string longName(5000, 'a');
    const struct {
        const char* name;
        std::function<TOVRESULT()> print;
        std::string expected;
    } cases[] = {
        {"UTF-8 arguments to a wide format",
         [&] { return host->Print(1, L"%s: bad chunk in %s(%d)\n", "Orlo Plug-In", "Grüße/Take 😀.wav", 42); },
         "Orlo Plug-In: bad chunk in Grüße/Take 😀.wav(42)"},
        {"numbers of every width the messages use",
         [&] { return host->Print(8, L"%d %x %llu %lu", -7, 0xBEEFu, 5368709120ull, 4294967295ul); },
         "-7 beef 5368709120 4294967295"},
        {"a narrow format with wide arguments",
         [&] { return host->PrintNarrow(2, "rate %s is %.3f, %ls", "29.97", 29.97, L"né"); },
         "rate 29.97 is 29.970, né"},
        {"wide text outside the basic plane", [&] { return host->Write(16, L"𝄞 clef"); }, "𝄞 clef"},
        {"a long message, not cut", [&] { return host->Print(1, L"[%s]", longName.c_str()); }, "[" + longName + "]"},
    };
    for (const auto& c : cases) {
        SCOPED_TRACE(c.name);
        host.ClearLines();
        ASSERT_EQ(c.print(), TOV_OK);
        EXPECT_EQ(host.Texts(), std::vector<std::string>{c.expected});
    }
}

TEST_F(HostConsole, MalformedUTF8ArgumentFailsWithoutOutput) {
    EXPECT_EQ(host->Print(1, L"%s", "\xC3\x28 broken"), TOV_E_INVALIDARG);
    EXPECT_TRUE(host.Lines().empty());
    EXPECT_EQ(host->Print(1, nullptr), TOV_E_INVALIDARG);
    EXPECT_EQ(host->Write(1, nullptr), TOV_E_INVALIDARG);
}

TEST_F(HostConsole, VerbosityFiltersByLevelBitAndHidesTracesByDefault) {
    const ::HostConsole defaults;
    EXPECT_TRUE(defaults.Shows(kTOVDebugLevelError));
    EXPECT_TRUE(defaults.Shows(kTOVDebugLevelStartup));
    EXPECT_FALSE(defaults.Shows(kTOVDebugLevelTrace));

    ASSERT_EQ(host->SetVerbosity(1 | 16), TOV_OK);
    EXPECT_EQ(host->GetVerbosity(), 17u);
    for (uint32_t level : {1, 2, 4, 8, 16}) ASSERT_EQ(host->Print(level, L"level %d", static_cast<int>(level)), TOV_OK);
    EXPECT_EQ(host.Lines(), (std::vector<std::pair<uint32_t, std::string>>{{1, "level 1"}, {16, "level 16"}}));
}

}  // namespace
