#include "reader/int24.h"

#include <cstring>

namespace HelperFunctions {

int24& int24::operator=(int value) {
    const uint32_t bits = static_cast<uint32_t>(value);
    m_Low = static_cast<uint16_t>(bits & 0xFFFF);
    m_High = static_cast<uint8_t>((bits >> 16) & 0xFF);
    return *this;
}

int32_t int24::Long() const {
    const int32_t value = (int32_t{m_High} << 16) | m_Low;
    return m_High >= 0x80 ? value - 0x1000000 : value;
}

void int24::endianswap() {
    unsigned char bytes[3];
    std::memcpy(bytes, this, 3);
    const unsigned char first = bytes[0];
    bytes[0] = bytes[2];
    bytes[2] = first;
    std::memcpy(this, bytes, 3);
}

}  // namespace HelperFunctions
