// Lines that the logger writes through the host's console.
#include <gtest/gtest.h>

#include <cwchar>

#include "TestHost.h"
#include "startup/ZEBLogger.h"
#include "startup/ZEBUtilLib.h"
#include "tov/ITOVString.h"

namespace {

class ZEBLogger : public ::testing::Test {
protected:
    void SetUp() override {
        ASSERT_EQ(ZEB::ZEBInitialize(host.Get()), TOV_OK);
        host.ClearLines();
    }
    void TearDown() override { ZEB::ZEBTerminate(); }

    TOVPtr<ITOVString> MakeString(const wchar_t* text, _tovUnicodeType type) {
        TOVPtr<ITOVString> s;
        EXPECT_EQ(host->CreateComponent(TOVCompID_TOVString, nullptr, IID_ITOVString, s.Out()), TOV_OK);
        EXPECT_EQ(s->Assign(type, text, static_cast<unsigned>(wcslen(text) + 1)), TOV_OK);
        return s;
    }

    TestHost host;
};

TEST_F(ZEBLogger, ANamePrefixesTheLineAndARenameReplacesIt) {
    TOVPtr<ITOVString> first = MakeString(L"ZEBUtilLib", kTOVUnicodeUTF16);
    TOVPtr<ITOVString> second = MakeString(L"second", kTOVUnicodeUTF32);
    ZEB::ZEBLogger unnamed;
    unnamed.Write(kTOVDebugLevelError, "plain %d", 7);
    ZEB::ZEBLogger logger(first.Get());
    logger.Write(kTOVDebugLevelWarning, L"%s(%d)", "/src/reader/Chunk.cpp", 120);
    EXPECT_EQ(first->GetUnicodeType(), kTOVUnicodeUTF16) << "the caller's string is given back in its encoding";
    logger.SetName(second.Get());
    logger.Write(kTOVDebugLevelError, "x");
    EXPECT_EQ(host.Lines(), (std::vector<std::pair<uint32_t, std::string>>{
                                {1u, "plain 7"}, {2u, "ZEBUtilLib: /src/reader/Chunk.cpp(120)"}, {1u, "second: x"}}));
}

TEST_F(ZEBLogger, EveryFormatEncodingFormatsUTF8Arguments) {
    TOVPtr<ITOVString> name = MakeString(L"Orlo Plug-In ✓", kTOVUnicodeWCHAR);
    ZEB::ZEBLogger logger(name.Get());
    const unsigned short utf16[] = {u'%', u's', u' ', 0xD83D, 0xDE00, 0};
    const unsigned int utf32[] = {U'%', U's', U' ', 0x1F600, 0};
    const unsigned char utf8[] = "%s \xF0\x9F\x98\x80";
    logger.Write(kTOVDebugLevelTrace, utf8, "Grüße");
    logger.Write(kTOVDebugLevelTrace, utf16, "Grüße");
    logger.Write(kTOVDebugLevelTrace, utf32, "Grüße");
    logger.Write(kTOVDebugLevelTrace, L"%s 😀", "Grüße");
    ASSERT_EQ(host.Lines().size(), 4u);
    for (const auto& line : host.Lines()) EXPECT_EQ(line.second, "Orlo Plug-In ✓: Grüße 😀");
}

}  // namespace
