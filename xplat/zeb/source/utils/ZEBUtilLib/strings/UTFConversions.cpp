#include "strings/UTFConversions.h"

#include <cstring>
#include <stdexcept>

// The standard library's UTF-8 and UTF-16 converters are deprecated, so these
// decoders do their work with the same results: the same text accepted, a
// std::range_error for the same malformed input, and the same silent stop at
// a sequence that the terminator cuts short (the converters report such a
// tail as incomplete, not as an error, and keep what came before it).

namespace ZEB {

namespace {

constexpr char32_t kMaxCodePoint = 0x10FFFF;

[[noreturn]] void ThrowMalformed(const char* what) { throw std::range_error(what); }

bool IsContinuation(unsigned char byte) { return (byte & 0xC0) == 0x80; }

// One code point from `text`, which holds `avail` (at least 1) bytes before
// the terminator. Returns false for a sequence the terminator cuts short.
// Surrogate code points pass, as they do through the standard converter.
bool ReadUTF8(const unsigned char*& text, std::size_t avail, char32_t& codePoint) {
    const unsigned char c1 = text[0];
    if (c1 < 0x80) {
        codePoint = c1;
        text += 1;
        return true;
    }
    // A stray continuation byte, or the lead of an overlong two-byte form.
    if (c1 < 0xC2 || c1 >= 0xF5) ThrowMalformed("fromUTF8: invalid lead byte");
    const std::size_t size = c1 < 0xE0 ? 2 : c1 < 0xF0 ? 3 : 4;
    // A sequence that the terminator cuts short is not judged at all.
    if (avail < size) return false;
    for (std::size_t i = 1; i < size; ++i) {
        if (!IsContinuation(text[i])) ThrowMalformed("fromUTF8: invalid continuation byte");
    }
    const unsigned char c2 = text[1];
    if ((c1 == 0xE0 && c2 < 0xA0) || (c1 == 0xF0 && c2 < 0x90)) ThrowMalformed("fromUTF8: overlong form");
    if (c1 == 0xF4 && c2 >= 0x90) ThrowMalformed("fromUTF8: above U+10FFFF");
    char32_t value = c1 & (0x7F >> size);
    for (std::size_t i = 1; i < size; ++i) value = (value << 6) | (text[i] & 0x3F);
    codePoint = value;
    text += size;
    return true;
}

bool IsHighSurrogate(char32_t unit) { return unit >= 0xD800 && unit <= 0xDBFF; }

bool IsLowSurrogate(char32_t unit) { return unit >= 0xDC00 && unit <= 0xDFFF; }

// The unit at `bytes` read as little-endian, whatever the machine's order.
char32_t ReadLittleEndianUnit(const unsigned char* bytes) { return bytes[0] | (char32_t(bytes[1]) << 8); }

void AppendUTF8(std::string& out, char32_t codePoint) {
    if (codePoint < 0x80) {
        out += static_cast<char>(codePoint);
        return;
    }
    const int continuations = codePoint < 0x800 ? 1 : codePoint < 0x10000 ? 2 : 3;
    static const unsigned char kLead[] = {0, 0xC0, 0xE0, 0xF0};
    out += static_cast<char>(kLead[continuations] | (codePoint >> (6 * continuations)));
    for (int shift = 6 * (continuations - 1); shift >= 0; shift -= 6) {
        out += static_cast<char>(0x80 | ((codePoint >> shift) & 0x3F));
    }
}

}  // namespace

std::wstring fromUTF8(const unsigned char* text) {
    std::wstring out;
    wFromUTF8(reinterpret_cast<const char*>(text), out);
    return out;
}

void wFromUTF8(const char* text, std::wstring& out) {
    const auto* next = reinterpret_cast<const unsigned char*>(text);
    const unsigned char* const end = next + std::strlen(text);
    std::wstring decoded;
    char32_t codePoint = 0;
    while (next != end && ReadUTF8(next, static_cast<std::size_t>(end - next), codePoint)) {
        decoded += static_cast<wchar_t>(codePoint);
    }
    out.swap(decoded);
}

std::wstring fromUTF16(const unsigned short* text) {
    // The units go through a 16-bit string and are then decoded from its
    // bytes as little-endian, so no byte order mark is looked for.
    const std::u16string units(reinterpret_cast<const char16_t*>(text));
    std::size_t avail = units.size();
    const auto* bytes = reinterpret_cast<const unsigned char*>(units.data());
    std::wstring out;
    while (avail != 0) {
        char32_t unit = ReadLittleEndianUnit(bytes);
        std::size_t used = 1;
        if (IsHighSurrogate(unit)) {
            // A high surrogate that the terminator cuts short ends the text.
            if (avail < 2) break;
            const char32_t low = ReadLittleEndianUnit(bytes + 2);
            if (!IsLowSurrogate(low)) ThrowMalformed("fromUTF16: unpaired high surrogate");
            unit = 0x10000 + ((unit - 0xD800) << 10) + (low - 0xDC00);
            used = 2;
        } else if (IsLowSurrogate(unit)) {
            ThrowMalformed("fromUTF16: unpaired low surrogate");
        }
        out += static_cast<wchar_t>(unit);
        bytes += 2 * used;
        avail -= used;
    }
    return out;
}

std::wstring fromUTF32(const unsigned int* text) {
    std::wstring out;
    for (; *text != 0; ++text) out += static_cast<wchar_t>(*text);
    return out;
}

std::string wToUTF8(const std::wstring& text) {
    std::string out;
    out.reserve(text.size());
    for (wchar_t unit : text) {
        const auto codePoint = static_cast<char32_t>(unit);
        if (codePoint > kMaxCodePoint) ThrowMalformed("wToUTF8: above U+10FFFF");
        AppendUTF8(out, codePoint);
    }
    return out;
}

void wToUTF8(const wchar_t* text, std::string& out) { out = wToUTF8(std::wstring(text)); }

}  // namespace ZEB
