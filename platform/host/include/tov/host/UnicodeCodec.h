#pragma once
/// Strict conversion between the Unicode encoding forms and code points.
///
/// Decoders refuse malformed input by returning false and leaving their
/// output untouched: overlong or truncated UTF-8, the bytes 0xC0, 0xC1 and
/// 0xF5 to 0xFF, unexpected continuation bytes, unpaired surrogates (also
/// when encoded in UTF-8 or UTF-32), and values above 0x10FFFF.
/// Encoders never fail: a value that is not a Unicode scalar value becomes
/// U+FFFD, so text that was tampered with still encodes to valid output.
/// UTF-16 and UTF-32 are in native byte order.
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

class UnicodeCodec {
public:
    static constexpr char32_t kReplacement = 0xFFFD;

    /// Whether `value` is at most 0x10FFFF and not a surrogate.
    static bool IsScalarValue(uint32_t value);

    /// Whether the `n` bytes at `text` are well-formed UTF-8, by the rules the decoder keeps.
    static bool IsValidUTF8(const unsigned char* text, size_t n);
    /// Replace `out` by the code points of the `n` units at `text`. `Text` is
    /// std::u32string or std::wstring: wchar_t is 32 bits here and holds
    /// UTF-32, so both hold code points.
    template <class Text>
    static bool DecodeUTF8(const unsigned char* text, size_t n, Text& out);
    template <class Text>
    static bool DecodeUTF16(const unsigned short* text, size_t n, Text& out);
    template <class Text>
    static bool DecodeUTF32(const unsigned int* text, size_t n, Text& out);
    template <class Text>
    static bool DecodeUTF32(const wchar_t* text, size_t n, Text& out);

    /// No terminator is added.
    static std::string EncodeUTF8(std::u32string_view text);
    static std::string EncodeUTF8(std::wstring_view text);
    static std::vector<unsigned short> EncodeUTF16(std::u32string_view text);
    static std::vector<unsigned short> EncodeUTF16(std::wstring_view text);
    static std::vector<unsigned int> EncodeUTF32(std::u32string_view text);
    static std::vector<unsigned int> EncodeUTF32(std::wstring_view text);

    /// Units that `codePoint` takes once encoded (a non-scalar value counts as U+FFFD).
    static size_t UTF8Length(char32_t codePoint);
    static size_t UTF16Length(char32_t codePoint);
};
