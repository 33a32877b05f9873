#pragma once
/// A constant string literal as the utility library sees it: its UTF-16 text
/// and its length. Where the platform has no constant string object of its
/// own, this small literal type stands in, and `tovUTF16LiteralToUTF16` reads
/// it through `Length` and `GetCString` as it would read such an object.
#include <cstddef>
#include <cstring>

/// The one encoding the literal can hand out: UTF-16 in native order.
inline constexpr unsigned int kTOVStringEncodingUnicode = 256;

struct __tovStringLiteralRef {
    /// The UTF-16 units; a literal made by `tovStringLiteral` is zero-terminated.
    const char16_t* text;
    /// Units of text, without the terminator.
    std::size_t length;

    constexpr std::size_t Length() const { return length; }

    /// Copies the text and a terminating zero unit into `buffer` of `capacity`
    /// bytes. Refuses (false, nothing written) another encoding than
    /// kTOVStringEncodingUnicode, a buffer too small for text and terminator,
    /// and a literal without text.
    bool GetCString(void* buffer, std::size_t capacity, unsigned int encoding) const {
        if (encoding != kTOVStringEncodingUnicode || !buffer || (length != 0 && !text)) return false;
        if (capacity / sizeof(char16_t) <= length) return false;
        if (length != 0) std::memcpy(buffer, text, length * sizeof(char16_t));
        std::memset(static_cast<char*>(buffer) + length * sizeof(char16_t), 0, sizeof(char16_t));
        return true;
    }
};

/// How the library passes a literal around: like a constant string reference.
typedef const __tovStringLiteralRef* tovStringLiteralRef;

/// The literal type of a `u"..."` literal: `static constexpr auto k = tovStringLiteral(u"/");`
template <std::size_t N>
constexpr __tovStringLiteralRef tovStringLiteral(const char16_t (&text)[N]) {
    return __tovStringLiteralRef{text, N - 1};
}
