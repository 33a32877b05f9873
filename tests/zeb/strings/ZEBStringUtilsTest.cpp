// The string utilities: substrings, prefix and pattern tests, and path pieces,
// including the scans that never look at index 0.
#include <gtest/gtest.h>

#include <climits>
#include <functional>
#include <string>
#include <vector>

#include "StringFixture.h"
#include "TestText.h"
#include "strings/ZEBStringUtils.h"

namespace {

using ZEB::ZEBString;
namespace Utils = ZEB::ZEBStringUtils;

using ZEBStringUtils = StringFixture;

TEST_F(ZEBStringUtils, PathPiecesNeverTakeIndexZeroAsASeparatorOrDot) {
    using PathFunction = std::function<ZEBString(const ZEBString&)>;
    const PathFunction fileName = [](const ZEBString& p) { return Utils::GetFileName(p); };
    const PathFunction parent = [](const ZEBString& p) { return Utils::GetParentFolder(p); };
    const PathFunction caption = [](const ZEBString& p) { return Utils::GetFileCaption(p); };
    const PathFunction ext = [](const ZEBString& p) { return Utils::GetExtName(p, 0); };
    const PathFunction extWithDot = [](const ZEBString& p) { return Utils::GetExtName(p, 1); };
    const PathFunction standardize = [](const ZEBString& p) { return Utils::StandardizePath(p); };
    struct Case {
        const char* function;
        const PathFunction& call;
        const char16_t* path;
        const wchar_t* expected;
    };
    const std::vector<Case> cases = {
        {"GetFileName", fileName, u"/a.wav", L"/a.wav"},
        {"GetFileName", fileName, u"/x/a.wav", L"a.wav"},
        {"GetFileName", fileName, u"x/", L""},
        {"GetFileName", fileName, u"\\x\\a.wav", L"a.wav"},
        {"GetFileName", fileName, u"x\\y/a", L"a"},
        {"GetFileName", fileName, u"", L""},
        {"GetParentFolder", parent, u"/x/a.wav", L"/x/"},
        {"GetParentFolder", parent, u"/a.wav", L""},
        {"GetParentFolder", parent, u"x\\y\\z", L"x\\y\\"},
        {"GetParentFolder", parent, u"\U0001F600/a", L"\U0001F600/"},
        {"GetFileCaption", caption, u"/x/a.b.wav", L"a.b"},
        {"GetFileCaption", caption, u"/x/.wav", L"/x/.wav"},
        {"GetFileCaption", caption, u"/x/a.", L"a"},
        {"GetFileCaption", caption, u"/x/", L""},
        {"GetExtName", ext, u"/x/a.wav", L"wav"},
        {"GetExtName with dot", extWithDot, u"/x/a.wav", L".wav"},
        {"GetExtName", ext, u"/x/.wav", L""},
        {"GetExtName", ext, u"/x/a.", L""},
        {"GetExtName with dot", extWithDot, u"/x/a.", L"."},
        {"GetExtName", ext, u"/a.b/c", L""},
        {"StandardizePath", standardize, u"a\\b\\c", L"a/b/c"},
        {"StandardizePath", standardize, u"\\\U0001F600\\", L"/\U0001F600/"},
    };
    for (const auto& c : cases) {
        const ZEBString path(U16(c.path));
        EXPECT_EQ(TextOf(c.call(path)), c.expected) << c.function << " of " << TextOf(path).size() << "-char path";
    }
}

TEST_F(ZEBStringUtils, CombinePath) {
    struct Case {
        const char *base, *relative;
        const wchar_t* expected;
    };
    const std::vector<Case> cases = {
        {"", "/a", L"a"}, {"x", "a", L"x/a"}, {"x\\", "\\a\\b", L"x/a/b"}, {"x/", "a", L"x/a"},
        {"x", "", L"x/"}, {"", "", L""},      {"/", "//a", L"//a"},        {"déjà", "vu", L"déjà/vu"},
    };
    for (const auto& c : cases) {
        EXPECT_EQ(TextOf(Utils::CombinePath(ZEBString(U8(c.base)), ZEBString(U8(c.relative)))), c.expected)
            << "'" << c.base << "' + '" << c.relative << "'";
    }
}

TEST_F(ZEBStringUtils, ResultEncodings) {
    const ZEBString utf8Path(U8("/x/noext"));
    EXPECT_EQ(Utils::GetFileCaption(utf8Path).GetUnicodeType(), kTOVUnicodeUTF8) << "the whole path, as it came";
    EXPECT_EQ(Utils::GetParentFolder(ZEBString(U8("a"))).GetUnicodeType(), kTOVUnicodeUTF16) << "empty results";
    EXPECT_EQ(Utils::GetSubString(utf8Path, 1, 1).GetUnicodeType(), kTOVUnicodeUTF32);

    const ZEBString wide = Utils::GetWCharZEBString(ZEBString(U8("a\\b")));
    const ZEBString standard = Utils::StandardizePath(wide);
    EXPECT_EQ(standard.GetUnicodeType(), kTOVUnicodeWCHAR);
    EXPECT_EQ(TextOf(wide), L"a\\b") << "the source is not rewritten";

    const ZEBString source(U16(u"\u00E9"));
    const struct {
        ZEBString copy;
        _tovUnicodeType type;
    } copies[] = {{Utils::GetUTF8ZEBString(source), kTOVUnicodeUTF8},
                  {Utils::GetUTF16ZEBString(source), kTOVUnicodeUTF16},
                  {Utils::GetUTF32ZEBString(source), kTOVUnicodeUTF32},
                  {Utils::GetWCharZEBString(source), kTOVUnicodeWCHAR}};
    for (const auto& c : copies) {
        EXPECT_EQ(c.copy.GetUnicodeType(), c.type);
        EXPECT_NE(c.copy.InArg(), source.InArg()) << "a copy even in the same encoding";
        EXPECT_EQ(TextOf(c.copy), L"é");
    }
}

TEST_F(ZEBStringUtils, GetSubString) {
    struct Case {
        const char16_t* text;
        unsigned int start;
        int count;
        const wchar_t* expected;
    };
    const std::vector<Case> cases = {
        {u"abc", 0, 0, L""},           {u"abc", 1, 1, L"b"},
        {u"abc", 1, 1000, L"bc"},      {u"abc", 0, -1, L"abc"},
        {u"abc", 5, -1, L""},          {u"abc", 1, INT_MAX, L"bc"},
        {u"abc", 0xF0000000u, 1, L""}, {u"\U0001F600xy", 0, 1, L"\U0001F600"},
    };
    for (const auto& c : cases) {
        EXPECT_EQ(TextOf(Utils::GetSubString(ZEBString(U16(c.text)), c.start, c.count)), c.expected)
            << "start " << c.start << " count " << c.count;
    }
}

TEST_F(ZEBStringUtils, CreateZEBStringCutsToANonNegativeCount) {
    ExpectMadeStrings({
        {"UTF-8 whole", [] { return Utils::CreateZEBString(U8("héllo"), -1); }, kTOVUnicodeUTF8, L"héllo"},
        {"UTF-8 cut", [] { return Utils::CreateZEBString(U8("héllo"), 2); }, kTOVUnicodeUTF32, L"hé"},
        {"UTF-16 whole", [] { return Utils::CreateZEBString(U16(u"ab"), -5); }, kTOVUnicodeUTF16, L"ab"},
        {"UTF-32 cut to 0", [] { return Utils::CreateZEBString(U32(U"ab"), 0); }, kTOVUnicodeUTF16, L""},
        {"wide whole", [] { return Utils::CreateWCharZEBString(L"wide", -1); }, kTOVUnicodeWCHAR, L"wide"},
        {"wide cut", [] { return Utils::CreateWCharZEBString(L"wide", 2); }, kTOVUnicodeUTF32, L"wi"},
        {"wide null", [] { return Utils::CreateWCharZEBString(nullptr, -1); }, kTOVUnicodeUTF16, L""},
    });
}

TEST_F(ZEBStringUtils, PrefixAndSuffixIgnoreAsciiCaseWhateverTheLastArgument) {
    struct Case {
        const char *s, *pattern;
        bool starts, ends;
    };
    const std::vector<Case> cases = {
        {"ABC", "ab", true, false},  {"A.WAV", ".wav", false, true}, {"abc", "", true, true},
        {"ab", "abc", false, false}, {"abc", "abc", true, true},     {"😀x", "😀", true, false},
    };
    for (const auto& c : cases) {
        const ZEBString s(U8(c.s));
        const ZEBString pattern(U8(c.pattern));
        const std::wstring wide = TextOf(pattern);
        const std::string label = std::string(c.s) + " / " + c.pattern;
        for (int flag : {0, 1}) {
            EXPECT_EQ(Utils::IsStartWith(s, pattern, flag), c.starts) << label << " flag " << flag;
            EXPECT_EQ(Utils::IsEndWith(s, pattern, flag), c.ends) << label << " flag " << flag;
        }
        EXPECT_EQ(Utils::IsStartWith(s, U8(c.pattern), 0), c.starts) << label;
        EXPECT_EQ(Utils::IsStartWith(s, pattern.GetUTF16String(), 0), c.starts) << label;
        EXPECT_EQ(Utils::IsStartWith(s, pattern.GetUTF32String(), 0), c.starts) << label;
        EXPECT_EQ(Utils::IsStartWithWChar(s, wide.c_str(), 0), c.starts) << label;
        EXPECT_EQ(Utils::IsEndWith(s, U8(c.pattern), 0), c.ends) << label;
        EXPECT_EQ(Utils::IsEndWith(s, pattern.GetUTF16String(), 0), c.ends) << label;
        EXPECT_EQ(Utils::IsEndWith(s, pattern.GetUTF32String(), 0), c.ends) << label;
        EXPECT_EQ(Utils::IsEndWithWChar(s, wide.c_str(), 0), c.ends) << label;
    }
}

TEST_F(ZEBStringUtils, FixLengthPatternMatch) {
    struct Case {
        const char *s, *pattern;
        int ignoreCase;
        bool expected;
    };
    const std::vector<Case> cases = {
        {"a1", "A?", 0, false}, {"a1", "A?", 1, true},  {"a1", "A??", 1, false}, {"abc", "ab", 1, false},
        {"", "", 0, true},      {"?b", "a?", 0, false}, {"😀b", "?b", 0, true},   {"é", "É", 1, false},
    };
    for (const auto& c : cases) {
        const ZEBString s(U8(c.s));
        const ZEBString pattern(U8(c.pattern));
        const std::string label = std::string(c.s) + " / " + c.pattern + " ignoreCase " + std::to_string(c.ignoreCase);
        EXPECT_EQ(Utils::FixLengthPatternMatch(s, pattern, c.ignoreCase), c.expected) << label;
        EXPECT_EQ(Utils::FixLengthPatternMatch(s, U8(c.pattern), c.ignoreCase), c.expected) << label;
        EXPECT_EQ(Utils::FixLengthPatternMatch(s, pattern.GetUTF16String(), c.ignoreCase), c.expected) << label;
        EXPECT_EQ(Utils::FixLengthPatternMatch(s, pattern.GetUTF32String(), c.ignoreCase), c.expected) << label;
        EXPECT_EQ(Utils::FixLengthPatternMatchWChar(s, TextOf(pattern).c_str(), c.ignoreCase), c.expected) << label;
    }
}

TEST_F(ZEBStringUtils, IsSameCharFoldsOnlyAsciiLetters) {
    struct Case {
        wchar_t a, b;
        int ignoreCase;
        bool expected;
    };
    const Case cases[] = {
        {L'a', L'a', 0, true},  {L'a', L'A', 0, false}, {L'a', L'A', 1, true},  {L'Z', L'z', 7, true},
        {L'@', L'`', 1, false}, {L'[', L'{', 1, false}, {L'é', L'É', 1, false}, {L'a', L'b', 1, false},
    };
    for (const auto& c : cases) {
        EXPECT_EQ(Utils::IsSameChar(c.a, c.b, c.ignoreCase), c.expected)
            << static_cast<int>(c.a) << " " << static_cast<int>(c.b) << " " << c.ignoreCase;
    }
}

TEST(ZEBStringUtilsBeforeStart, EvenEmptyResultsNeedTheLibrary) {
    ExpectThrowsResult([] { Utils::GetSubString(ZEBString(), 0, 0); }, ZEB_E_NOTREADY, "count 0");
    ExpectThrowsResult([] { Utils::CreateWCharZEBString(L"a", -1); }, ZEB_E_NOTREADY, "wide text");
}

}  // namespace
