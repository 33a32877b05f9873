// Strict decoding and lossless encoding of the three Unicode encoding forms.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "tov/host/UnicodeCodec.h"

namespace {

std::vector<unsigned char> Bytes(std::initializer_list<int> values) {
    return std::vector<unsigned char>(values.begin(), values.end());
}

struct Encoded {
    std::u32string codePoints;
    std::vector<unsigned char> utf8;
    std::vector<unsigned short> utf16;
};

// The boundaries of each UTF-8 length and of the surrogate range, plus mixed text.
const Encoded kEncoded[] = {
    {U"", {}, {}},
    {U"A", Bytes({0x41}), {0x41}},
    {U"\u007F\u0080", Bytes({0x7F, 0xC2, 0x80}), {0x7F, 0x80}},
    {U"\u07FF\u0800", Bytes({0xDF, 0xBF, 0xE0, 0xA0, 0x80}), {0x7FF, 0x800}},
    {U"\uD7FF\uE000", Bytes({0xED, 0x9F, 0xBF, 0xEE, 0x80, 0x80}), {0xD7FF, 0xE000}},
    {U"\uFFFF\U00010000", Bytes({0xEF, 0xBF, 0xBF, 0xF0, 0x90, 0x80, 0x80}), {0xFFFF, 0xD800, 0xDC00}},
    {U"\U0010FFFF", Bytes({0xF4, 0x8F, 0xBF, 0xBF}), {0xDBFF, 0xDFFF}},
    {U"Aé€😀",
     Bytes({0x41, 0xC3, 0xA9, 0xE2, 0x82, 0xAC, 0xF0, 0x9F, 0x98, 0x80}),
     {0x41, 0xE9, 0x20AC, 0xD83D, 0xDE00}},
};

TEST(UnicodeCodec, EncodesAndDecodesEveryFormBothWays) {
    for (const Encoded& c : kEncoded) {
        SCOPED_TRACE(testing::PrintToString(c.utf8));
        const std::string utf8 = UnicodeCodec::EncodeUTF8(c.codePoints);
        EXPECT_EQ(std::vector<unsigned char>(utf8.begin(), utf8.end()), c.utf8);
        EXPECT_EQ(UnicodeCodec::EncodeUTF16(c.codePoints), c.utf16);
        EXPECT_EQ(UnicodeCodec::EncodeUTF32(c.codePoints),
                  std::vector<unsigned int>(c.codePoints.begin(), c.codePoints.end()));

        EXPECT_TRUE(UnicodeCodec::IsValidUTF8(c.utf8.data(), c.utf8.size()));
        std::u32string decoded;
        ASSERT_TRUE(UnicodeCodec::DecodeUTF8(c.utf8.data(), c.utf8.size(), decoded));
        EXPECT_EQ(decoded, c.codePoints);
        ASSERT_TRUE(UnicodeCodec::DecodeUTF16(c.utf16.data(), c.utf16.size(), decoded));
        EXPECT_EQ(decoded, c.codePoints);
        const std::wstring wide(c.codePoints.begin(), c.codePoints.end());
        ASSERT_TRUE(UnicodeCodec::DecodeUTF32(wide.data(), wide.size(), decoded));
        EXPECT_EQ(decoded, c.codePoints);

        size_t utf8Units = 0, utf16Units = 0;
        for (char32_t cp : c.codePoints) {
            utf8Units += UnicodeCodec::UTF8Length(cp);
            utf16Units += UnicodeCodec::UTF16Length(cp);
        }
        EXPECT_EQ(utf8Units, c.utf8.size());
        EXPECT_EQ(utf16Units, c.utf16.size());
    }
}

TEST(UnicodeCodec, RefusesMalformedUTF8AndKeepsTheOutput) {
    const std::vector<unsigned char> malformed[] = {
        Bytes({0xC0, 0x80}),              // overlong NUL
        Bytes({0xE0, 0x9F, 0xBF}),        // overlong 0x7FF
        Bytes({0xF0, 0x8F, 0xBF, 0xBF}),  // overlong 0xFFFF
        Bytes({0xC3}),                    // truncated at the end
        Bytes({0xF0, 0x9F, 0x98}),
        Bytes({0xC3, 0x41}),              // continuation missing before more text
        Bytes({0x80}),                    // a stray continuation byte
        Bytes({0xF5, 0x80, 0x80, 0x80}),  // leads that cannot occur
        Bytes({0xFF}),
        Bytes({0xED, 0xA0, 0x80}),        // an encoded surrogate
        Bytes({0xF4, 0x90, 0x80, 0x80}),  // above 0x10FFFF
    };
    for (const auto& bytes : malformed) {
        SCOPED_TRACE(testing::PrintToString(bytes));
        EXPECT_FALSE(UnicodeCodec::IsValidUTF8(bytes.data(), bytes.size()));
        for (size_t ascii : {7, 9}) {  // within and behind the ASCII read eight bytes at a time
            std::vector<unsigned char> behind(ascii, 'a');
            behind.insert(behind.end(), bytes.begin(), bytes.end());
            EXPECT_FALSE(UnicodeCodec::IsValidUTF8(behind.data(), behind.size())) << ascii;
        }
        std::u32string out = U"kept";
        EXPECT_FALSE(UnicodeCodec::DecodeUTF8(bytes.data(), bytes.size(), out));
        EXPECT_EQ(out, U"kept");
    }
}

TEST(UnicodeCodec, RefusesUnpairedSurrogatesAndValuesOutOfRange) {
    const std::vector<unsigned short> utf16[] = {
        {0xD800},       {0xDC00},         {0xDC00, 0xDC00},         {0x41, 0xD83D},
        {0xD83D, 0x41}, {0xDE00, 0xD83D}, {0xD800, 0xD800, 0xDC00},
    };
    const std::vector<unsigned int> utf32[] = {{0xD800}, {0x41, 0xDFFF}, {0x110000}, {0xFFFFFFFF}};
    const auto refused = [](const auto& units, auto decode) {
        SCOPED_TRACE(testing::PrintToString(units));
        std::u32string out = U"kept";
        EXPECT_FALSE(decode(units.data(), units.size(), out));
        EXPECT_EQ(out, U"kept");
    };
    for (const auto& units : utf16) refused(units, [](auto... a) { return UnicodeCodec::DecodeUTF16(a...); });
    for (const auto& units : utf32) refused(units, [](auto... a) { return UnicodeCodec::DecodeUTF32(a...); });
    const wchar_t negative[] = {L'a', static_cast<wchar_t>(-1)};
    std::u32string out;
    EXPECT_FALSE(UnicodeCodec::DecodeUTF32(negative, 2, out));
}

TEST(UnicodeCodec, EncodersReplaceWhatIsNoScalarValue) {
    const std::u32string bad = {U'a', static_cast<char32_t>(0xD800), static_cast<char32_t>(0x110000)};
    EXPECT_EQ(UnicodeCodec::EncodeUTF8(bad), "a\xEF\xBF\xBD\xEF\xBF\xBD");
    EXPECT_EQ(UnicodeCodec::EncodeUTF16(bad), (std::vector<unsigned short>{0x61, 0xFFFD, 0xFFFD}));
    EXPECT_EQ(UnicodeCodec::EncodeUTF32(bad), (std::vector<unsigned int>{0x61, 0xFFFD, 0xFFFD}));
    const std::wstring wide = {L'\u00E9', static_cast<wchar_t>(0xDC00), static_cast<wchar_t>(-5)};
    EXPECT_EQ(UnicodeCodec::EncodeUTF8(wide), "\xC3\xA9\xEF\xBF\xBD\xEF\xBF\xBD");
    EXPECT_EQ(UnicodeCodec::UTF8Length(0xD800), 3u);
    EXPECT_EQ(UnicodeCodec::UTF16Length(0x110000), 1u);
}

}  // namespace
