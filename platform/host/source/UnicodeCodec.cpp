#include "tov/host/UnicodeCodec.h"

#include <cstring>

static_assert(sizeof(wchar_t) == 4, "wide text is handled as UTF-32");

namespace {

bool IsContinuation(unsigned char byte) { return (byte & 0xC0) == 0x80; }

// Whether the eight bytes at `text` are all ASCII.
bool EightASCII(const unsigned char* text) {
    uint64_t bytes;
    std::memcpy(&bytes, text, sizeof bytes);
    return (bytes & 0x8080808080808080u) == 0;
}

// The length of the well-formed UTF-8 sequence at `text[i]`, whose code point
// goes to `cp`; 0 for a malformed one.
inline size_t UTF8Sequence(const unsigned char* text, size_t n, size_t i, uint32_t& cp) {
    const unsigned char lead = text[i];
    if (lead < 0x80) {
        cp = lead;
        return 1;
    }
    size_t length;
    uint32_t minimum;
    if (lead >= 0xC2 && lead <= 0xDF) {
        length = 2, cp = lead & 0x1F, minimum = 0x80;
    } else if (lead >= 0xE0 && lead <= 0xEF) {
        length = 3, cp = lead & 0x0F, minimum = 0x800;
    } else if (lead >= 0xF0 && lead <= 0xF4) {
        length = 4, cp = lead & 0x07, minimum = 0x10000;
    } else {
        return 0;  // a stray continuation byte, 0xC0, 0xC1 or 0xF5 and above
    }
    if (n - i < length) return 0;
    for (size_t k = 1; k < length; ++k) {
        if (!IsContinuation(text[i + k])) return 0;
        cp = (cp << 6) | (text[i + k] & 0x3F);
    }
    // Overlong forms, encoded surrogates and values past 0x10FFFF.
    if (cp < minimum || !UnicodeCodec::IsScalarValue(cp)) return 0;
    return length;
}

char32_t Scalar(uint32_t value) {
    return UnicodeCodec::IsScalarValue(value) ? static_cast<char32_t>(value) : UnicodeCodec::kReplacement;
}

template <class CodePoint>
std::string EncodeUTF8Of(const CodePoint* text, size_t n) {
    std::string out;
    out.reserve(n);
    for (size_t i = 0; i < n; ++i) {
        const char32_t cp = Scalar(static_cast<uint32_t>(text[i]));
        if (cp < 0x80) {
            out += static_cast<char>(cp);
        } else if (cp < 0x800) {
            out += static_cast<char>(0xC0 | (cp >> 6));
            out += static_cast<char>(0x80 | (cp & 0x3F));
        } else if (cp < 0x10000) {
            out += static_cast<char>(0xE0 | (cp >> 12));
            out += static_cast<char>(0x80 | ((cp >> 6) & 0x3F));
            out += static_cast<char>(0x80 | (cp & 0x3F));
        } else {
            out += static_cast<char>(0xF0 | (cp >> 18));
            out += static_cast<char>(0x80 | ((cp >> 12) & 0x3F));
            out += static_cast<char>(0x80 | ((cp >> 6) & 0x3F));
            out += static_cast<char>(0x80 | (cp & 0x3F));
        }
    }
    return out;
}

template <class CodePoint>
std::vector<unsigned short> EncodeUTF16Of(const CodePoint* text, size_t n) {
    std::vector<unsigned short> out;
    out.reserve(n);
    for (size_t i = 0; i < n; ++i) {
        const char32_t cp = Scalar(static_cast<uint32_t>(text[i]));
        if (cp < 0x10000) {
            out.push_back(static_cast<unsigned short>(cp));
        } else {
            out.push_back(static_cast<unsigned short>(0xD800 + ((cp - 0x10000) >> 10)));
            out.push_back(static_cast<unsigned short>(0xDC00 + ((cp - 0x10000) & 0x3FF)));
        }
    }
    return out;
}

template <class CodePoint>
std::vector<unsigned int> EncodeUTF32Of(const CodePoint* text, size_t n) {
    std::vector<unsigned int> out(n);
    for (size_t i = 0; i < n; ++i) out[i] = Scalar(static_cast<uint32_t>(text[i]));
    return out;
}

// The decoders write into a text sized for the most code points the input can
// hold, one per unit, and cut it to what was written: no growing on the way.
template <class Text, class Unit>
bool DecodeUTF32Of(const Unit* text, size_t n, Text& out) {
    Text decoded(n, 0);
    for (size_t i = 0; i < n; ++i) {
        const auto value = static_cast<uint32_t>(text[i]);
        if (!UnicodeCodec::IsScalarValue(value)) return false;
        decoded[i] = static_cast<typename Text::value_type>(value);
    }
    out = std::move(decoded);
    return true;
}

}  // namespace

bool UnicodeCodec::IsScalarValue(uint32_t value) { return value <= 0x10FFFF && (value < 0xD800 || value > 0xDFFF); }

bool UnicodeCodec::IsValidUTF8(const unsigned char* text, size_t n) {
    size_t i = 0;
    while (i < n) {
        // Most text is ASCII, which is checked eight bytes at a time.
        if (n - i >= 8 && EightASCII(text + i)) {
            i += 8;
            continue;
        }
        uint32_t cp;
        const size_t length = UTF8Sequence(text, n, i, cp);
        if (length == 0) return false;
        i += length;
    }
    return true;
}

template <class Text>
bool UnicodeCodec::DecodeUTF8(const unsigned char* text, size_t n, Text& out) {
    using CodePoint = typename Text::value_type;
    Text decoded(n, 0);
    CodePoint* next = decoded.data();
    uint32_t cp;
    for (size_t i = 0, length; i < n; i += length) {
        length = UTF8Sequence(text, n, i, cp);
        if (length == 0) return false;
        *next++ = static_cast<CodePoint>(cp);
    }
    decoded.resize(static_cast<size_t>(next - decoded.data()));
    out = std::move(decoded);
    return true;
}

template <class Text>
bool UnicodeCodec::DecodeUTF16(const unsigned short* text, size_t n, Text& out) {
    using CodePoint = typename Text::value_type;
    Text decoded(n, 0);
    CodePoint* next = decoded.data();
    for (size_t i = 0; i < n; ++i) {
        const uint32_t unit = text[i];
        if (unit < 0xD800 || unit > 0xDFFF) {
            *next++ = static_cast<CodePoint>(unit);
            continue;
        }
        if (unit > 0xDBFF || i + 1 == n) return false;  // a lone low half, or a high half at the end
        const uint32_t low = text[i + 1];
        if (low < 0xDC00 || low > 0xDFFF) return false;
        *next++ = static_cast<CodePoint>(0x10000 + ((unit - 0xD800) << 10) + (low - 0xDC00));
        ++i;
    }
    decoded.resize(static_cast<size_t>(next - decoded.data()));
    out = std::move(decoded);
    return true;
}

template <class Text>
bool UnicodeCodec::DecodeUTF32(const unsigned int* text, size_t n, Text& out) {
    return DecodeUTF32Of(text, n, out);
}

template <class Text>
bool UnicodeCodec::DecodeUTF32(const wchar_t* text, size_t n, Text& out) {
    return DecodeUTF32Of(text, n, out);
}

template bool UnicodeCodec::DecodeUTF8(const unsigned char*, size_t, std::u32string&);
template bool UnicodeCodec::DecodeUTF8(const unsigned char*, size_t, std::wstring&);
template bool UnicodeCodec::DecodeUTF16(const unsigned short*, size_t, std::u32string&);
template bool UnicodeCodec::DecodeUTF16(const unsigned short*, size_t, std::wstring&);
template bool UnicodeCodec::DecodeUTF32(const unsigned int*, size_t, std::u32string&);
template bool UnicodeCodec::DecodeUTF32(const unsigned int*, size_t, std::wstring&);
template bool UnicodeCodec::DecodeUTF32(const wchar_t*, size_t, std::u32string&);
template bool UnicodeCodec::DecodeUTF32(const wchar_t*, size_t, std::wstring&);

std::string UnicodeCodec::EncodeUTF8(std::u32string_view text) { return EncodeUTF8Of(text.data(), text.size()); }

std::string UnicodeCodec::EncodeUTF8(std::wstring_view text) { return EncodeUTF8Of(text.data(), text.size()); }

std::vector<unsigned short> UnicodeCodec::EncodeUTF16(std::u32string_view text) {
    return EncodeUTF16Of(text.data(), text.size());
}

std::vector<unsigned short> UnicodeCodec::EncodeUTF16(std::wstring_view text) {
    return EncodeUTF16Of(text.data(), text.size());
}

std::vector<unsigned int> UnicodeCodec::EncodeUTF32(std::u32string_view text) {
    return EncodeUTF32Of(text.data(), text.size());
}

std::vector<unsigned int> UnicodeCodec::EncodeUTF32(std::wstring_view text) {
    return EncodeUTF32Of(text.data(), text.size());
}

size_t UnicodeCodec::UTF8Length(char32_t codePoint) {
    const char32_t cp = Scalar(codePoint);
    return cp < 0x80 ? 1 : cp < 0x800 ? 2 : cp < 0x10000 ? 3 : 4;
}

size_t UnicodeCodec::UTF16Length(char32_t codePoint) { return Scalar(codePoint) < 0x10000 ? 1 : 2; }
