#pragma once
/// Integers laid out as bytes in a chosen byte order, for building audio files
/// in tests.
#include <cstdint>
#include <string>

namespace Bytes {

std::string LE16(uint16_t value);
std::string LE32(uint32_t value);
std::string LE64(uint64_t value);
std::string BE16(uint16_t value);
std::string BE32(uint32_t value);
/// `value` as an 80-bit IEEE 754 extended number, big-endian (AIFF's rate).
std::string Extended80(double value);
/// `text` cut or filled with zero bytes to exactly `size` bytes.
std::string Fixed(const std::string& text, size_t size);

}  // namespace Bytes
