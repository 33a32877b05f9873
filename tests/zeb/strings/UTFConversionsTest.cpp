// Conversions between encoded text and wide strings: what decodes, what is
// refused with std::range_error, and where a cut-short tail just ends the text.
#include <gtest/gtest.h>

#include <stdexcept>
#include <string>
#include <vector>

#include "strings/UTFConversions.h"

namespace {

struct Decoded {
    const char* name;
    std::string bytes;
    std::wstring expected;
};

TEST(UTFConversions, FromUTF8Decodes) {
    const std::vector<Decoded> cases = {
        {"two to four bytes", "\xC3\xA9\xE2\x82\xAC\xF0\x9F\x98\x80", L"é€\U0001F600"},
        {"largest code point", "\xF4\x8F\xBF\xBF", L"\U0010FFFF"},
        {"byte order mark is text", "\xEF\xBB\xBFx", L"\uFEFFx"},
        {"encoded surrogate passes", "\xED\xA0\x80", std::wstring(1, wchar_t(0xD800))},
        {"cut-short tail ends the text", "ab\xE2\x82", L"ab"},
        {"cut-short with a bad byte", "a\xE0\x41", L"a"},
    };
    for (const auto& c : cases) {
        EXPECT_EQ(ZEB::fromUTF8(reinterpret_cast<const unsigned char*>(c.bytes.c_str())), c.expected) << c.name;
        std::wstring out = L"old content";
        ZEB::wFromUTF8(c.bytes.c_str(), out);
        EXPECT_EQ(out, c.expected) << c.name;
    }
}

TEST(UTFConversions, FromUTF8RefusesMalformedText) {
    const std::vector<std::string> cases = {
        "\x80",              // continuation without lead
        "\xC1\xBF",          // overlong two bytes
        "\xE0\x80\x80",      // overlong three bytes
        "\xF0\x80\x80\x80",  // overlong four bytes
        "\xF4\x90\x80\x80",  // above U+10FFFF
        "\xF5\x80\x80\x80",  // lead byte beyond the range
        "\xC3\x41",          // lead followed by ASCII
        "ok\xE2\x82\x41",    // bad third byte
    };
    for (const auto& bytes : cases) {
        EXPECT_THROW(ZEB::fromUTF8(reinterpret_cast<const unsigned char*>(bytes.c_str())), std::range_error)
            << bytes.size() << " bytes";
        std::wstring out = L"kept";
        EXPECT_THROW(ZEB::wFromUTF8(bytes.c_str(), out), std::range_error);
        EXPECT_EQ(out, L"kept") << "a refused text leaves the target as it was";
    }
}

TEST(UTFConversions, FromUTF16) {
    struct Case {
        const char* name;
        std::vector<unsigned short> units;
        std::wstring expected;
    };
    const std::vector<Case> cases = {{"BMP", {u'a', 0xE9, 0x20AC}, L"aé€"},
                                     {"surrogate pair", {0xD83D, 0xDE00, u'!'}, L"\U0001F600!"},
                                     {"byte order mark is text", {0xFEFF, u'x'}, L"\uFEFFx"},
                                     {"cut-short pair ends the text", {u'a', 0xD83D}, L"a"},
                                     {"empty", {}, L""}};
    for (auto c : cases) {
        c.units.push_back(0);
        EXPECT_EQ(ZEB::fromUTF16(c.units.data()), c.expected) << c.name;
    }
    const std::vector<std::vector<unsigned short>> malformed = {
        {0xDE00, 0},                 // lone low surrogate
        {0xD83D, u'a', 0},           // high surrogate without its low
        {0xD83D, 0xD83D, 0xDE00, 0}  // two highs
    };
    for (const auto& units : malformed) EXPECT_THROW(ZEB::fromUTF16(units.data()), std::range_error);
}

TEST(UTFConversions, FromUTF32CopiesWithoutDecoding) {
    const unsigned int units[] = {0x41, 0xD800, 0x110000, 0};
    const std::wstring out = ZEB::fromUTF32(units);
    ASSERT_EQ(out.size(), 3u);
    EXPECT_EQ(static_cast<unsigned int>(out[1]), 0xD800u);
    EXPECT_EQ(static_cast<unsigned int>(out[2]), 0x110000u);
}

TEST(UTFConversions, WideToUTF8) {
    EXPECT_EQ(ZEB::wToUTF8(L"aé€\U0001F600"), "a\xC3\xA9\xE2\x82\xAC\xF0\x9F\x98\x80");
    EXPECT_EQ(ZEB::wToUTF8(L""), "");
    EXPECT_EQ(ZEB::wToUTF8(L"\U0010FFFF"), "\xF4\x8F\xBF\xBF");
    EXPECT_EQ(ZEB::wToUTF8(L"\u07FF\u0800"), "\xDF\xBF\xE0\xA0\x80") << "the two- and three-byte boundary";
    EXPECT_THROW(ZEB::wToUTF8(std::wstring(1, wchar_t(0x110000))), std::range_error);
    EXPECT_THROW(ZEB::wToUTF8(std::wstring(1, wchar_t(-1))), std::range_error);
    // Round trip through both directions on text with every sequence length.
    const std::wstring text = L"x\u00FF\u4E2D\U0001D11E";
    EXPECT_EQ(ZEB::fromUTF8(reinterpret_cast<const unsigned char*>(ZEB::wToUTF8(text).c_str())), text);
}

}  // namespace
