#include "Bytes.h"

#include <cmath>

namespace Bytes {

namespace {
std::string Little(uint64_t value, int count) {
    std::string out;
    for (int i = 0; i < count; ++i) out += static_cast<char>((value >> (8 * i)) & 0xFF);
    return out;
}
std::string Big(uint64_t value, int count) {
    std::string out;
    for (int i = count - 1; i >= 0; --i) out += static_cast<char>((value >> (8 * i)) & 0xFF);
    return out;
}
}  // namespace

std::string LE16(uint16_t value) { return Little(value, 2); }
std::string LE32(uint32_t value) { return Little(value, 4); }
std::string LE64(uint64_t value) { return Little(value, 8); }
std::string BE16(uint16_t value) { return Big(value, 2); }
std::string BE32(uint32_t value) { return Big(value, 4); }

std::string Extended80(double value) {
    if (value == 0.0) return std::string(10, '\0');
    const uint16_t sign = value < 0 ? 0x8000 : 0;
    int exponent = 0;
    // value = fraction × 2^exponent with fraction in [0.5, 1); the 64-bit
    // mantissa carries its integer bit, so it is fraction × 2^64.
    const double fraction = std::frexp(std::fabs(value), &exponent);
    const auto mantissa = static_cast<uint64_t>(std::ldexp(fraction, 64));
    return BE16(static_cast<uint16_t>(sign | (exponent - 1 + 16383))) + Big(mantissa, 8);
}

std::string Fixed(const std::string& text, size_t size) {
    std::string out = text.substr(0, size);
    out.resize(size, '\0');
    return out;
}

}  // namespace Bytes
