#include "grouping/UTF8Name.h"

namespace Grouping {

namespace {

bool IsContinuation(unsigned char byte) { return (byte & 0xC0) == 0x80; }

// The length of the sequence that starts with `lead`, with the range its
// second byte must lie in so that the value is neither overlong, a surrogate
// nor above 0x10FFFF; 0 for a byte that cannot start one.
size_t SequenceLength(unsigned char lead, unsigned char& low, unsigned char& high) {
    low = 0x80;
    high = 0xBF;
    if (lead < 0x80) return 1;
    if (lead < 0xC2) return 0;
    if (lead < 0xE0) return 2;
    if (lead < 0xF0) {
        if (lead == 0xE0) low = 0xA0;
        if (lead == 0xED) high = 0x9F;
        return 3;
    }
    if (lead < 0xF5) {
        if (lead == 0xF0) low = 0x90;
        if (lead == 0xF4) high = 0x8F;
        return 4;
    }
    return 0;
}

}  // namespace

std::string UTF8Name(const ZEB::ZEBString& text) {
    if (text.IsEmpty()) return std::string();
    return reinterpret_cast<const char*>(text.GetUTF8String());
}

ZEB::ZEBString NameText(const std::string& utf8) {
    return ZEB::ZEBString(reinterpret_cast<const unsigned char*>(utf8.c_str()));
}

std::optional<uint32_t> CountUTF8Characters(std::string_view bytes) {
    uint32_t characters = 0;
    for (size_t i = 0; i < bytes.size(); ++characters) {
        unsigned char low, high;
        const size_t length = SequenceLength(static_cast<unsigned char>(bytes[i]), low, high);
        if (length == 0 || bytes.size() - i < length) return std::nullopt;
        for (size_t k = 1; k < length; ++k) {
            const auto byte = static_cast<unsigned char>(bytes[i + k]);
            if (k == 1 ? byte < low || byte > high : !IsContinuation(byte)) return std::nullopt;
        }
        i += length;
    }
    return characters;
}

}  // namespace Grouping
