#pragma once
/// Access to the bytes of a file by length and positional read.
#include "tov/ITOVUnknown.h"

/// The host does not fix this identifier; it is chosen here, once.
inline constexpr _tovUID IID_IStorageCallback = {
    0x3C2B8D52, 0x5E7A, 0x4F0B, {0x9A, 0x61, 0x2D, 0x84, 0x0F, 0xB3, 0x6C, 0x17}};

class IStorageCallback : public ITOVUnknown {
public:
    virtual TOVRESULT GetLength(unsigned long long* out) = 0;
    /// Reads up to `size` bytes at `offset` into `buffer`.
    virtual TOVRESULT Read(unsigned long long offset, unsigned char* buffer, unsigned int size) = 0;

protected:
    ~IStorageCallback() = default;
};
