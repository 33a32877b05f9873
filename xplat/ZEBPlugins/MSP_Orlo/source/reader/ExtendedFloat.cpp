#include "reader/ExtendedFloat.h"

#include <cmath>
#include <cstdint>

namespace HelperFunctions {

namespace {
uint32_t BigEndian32(const unsigned char* p) {
    return (uint32_t{p[0]} << 24) | (uint32_t{p[1]} << 16) | (uint32_t{p[2]} << 8) | uint32_t{p[3]};
}
}  // namespace

double Convert_from_IEEE_754(unsigned char* bytes) {
    const bool negative = (bytes[0] & 0x80) != 0;
    bytes[0] &= 0x7F;
    const int exponent = (bytes[0] << 8) | bytes[1];
    const uint32_t high = BigEndian32(bytes + 2);
    const uint32_t low = BigEndian32(bytes + 6);
    if (exponent == 0 && high == 0 && low == 0) return 0.0;
    // The mantissa's integer bit is explicit, so no hidden one is added.
    const double value = std::ldexp(high, exponent - 16414) + std::ldexp(low, exponent - 16446);
    return negative ? -value : value;
}

}  // namespace HelperFunctions
