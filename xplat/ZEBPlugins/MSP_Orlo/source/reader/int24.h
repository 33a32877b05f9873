#pragma once
/// A packed three-byte signed sample value, as 24-bit PCM stores it.
#include <cstdint>

namespace HelperFunctions {

#pragma pack(push, 1)
class int24 {
public:
    int24() = default;
    /// Keeps the low 24 bits of `value`.
    int24& operator=(int value);
    /// The sign-extended value.
    int32_t Long() const;
    /// Exchanges the first and the third byte.
    void endianswap();

private:
    uint16_t m_Low = 0;
    uint8_t m_High = 0;
};
#pragma pack(pop)

static_assert(sizeof(int24) == 3, "int24 must stay three bytes to overlay sample data");

}  // namespace HelperFunctions
