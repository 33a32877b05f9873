#pragma once
/// Byte-order helpers: the chunk parsers swap a value read from a file whose
/// byte order is not the host's.
#include <cstdint>
#include <cstring>

namespace HelperFunctions {

/// Reverses the bytes of any plain integer in place.
template <typename T>
void SwapBytes(T& value) {
    unsigned char bytes[sizeof(T)];
    std::memcpy(bytes, &value, sizeof(T));
    for (size_t i = 0; i < sizeof(T) / 2; ++i) {
        const unsigned char b = bytes[i];
        bytes[i] = bytes[sizeof(T) - 1 - i];
        bytes[sizeof(T) - 1 - i] = b;
    }
    std::memcpy(&value, bytes, sizeof(T));
}

inline void SwapShort(int16_t& value) { SwapBytes(value); }
inline void SwapUShort(uint16_t& value) { SwapBytes(value); }
inline void SwapLong(int32_t& value) { SwapBytes(value); }
inline void SwapULong(uint32_t& value) { SwapBytes(value); }
inline void SwapLongLong(int64_t& value) { SwapBytes(value); }
inline void SwapULongLong(uint64_t& value) { SwapBytes(value); }

/// The host's byte order; true on every machine served.
inline bool IAmLittleEndian() {
    const uint16_t one = 1;
    unsigned char first;
    std::memcpy(&first, &one, 1);
    return first == 1;
}

}  // namespace HelperFunctions
