#pragma once
/// The 16-byte identifier of the component framework, laid out as a GUID.
#include <cstdint>
#include <cstring>

struct _tovUID {
    uint32_t Data1;
    uint16_t Data2;
    uint16_t Data3;
    uint8_t Data4[8];
};

/// Two identifiers are equal when all 16 bytes are equal; nothing else is compared.
inline bool operator==(const _tovUID& a, const _tovUID& b) {
    return a.Data1 == b.Data1 && a.Data2 == b.Data2 && a.Data3 == b.Data3 &&
           std::memcmp(a.Data4, b.Data4, sizeof a.Data4) == 0;
}
inline bool operator!=(const _tovUID& a, const _tovUID& b) { return !(a == b); }

/// Strict weak order over all 16 fields, so identifiers can key ordered maps.
inline bool operator<(const _tovUID& a, const _tovUID& b) {
    if (a.Data1 != b.Data1) return a.Data1 < b.Data1;
    if (a.Data2 != b.Data2) return a.Data2 < b.Data2;
    if (a.Data3 != b.Data3) return a.Data3 < b.Data3;
    return std::memcmp(a.Data4, b.Data4, sizeof a.Data4) < 0;
}
