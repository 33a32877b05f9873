#pragma once
/// Hashing of identifiers for the dictionary's tables.
#include <cstddef>
#include <cstring>

#include "aaf/AAFTypes.h"

namespace aafmodel {

struct UIDHash {
    size_t operator()(const aafUID_t& id) const noexcept {
        uint64_t a, b;
        std::memcpy(&a, &id, 8);
        std::memcpy(&b, reinterpret_cast<const char*>(&id) + 8, 8);
        return static_cast<size_t>(a * 0x9E3779B97F4A7C15ull ^ b);
    }
};

}  // namespace aafmodel
