#pragma once
/// Reads one integer field of a chunk, swapped when the file's byte order is
/// not the host's.
#include <cstdio>
#include <string>

#include "reader/ByteSwap.h"
#include "reader/ReadBytes.h"

namespace HelperFunctions {

/// The short-read message of every fixed field of a chunk; made once, as the
/// walk reads many small fields.
inline const std::string kShortReadMessage = "Some default error";

template <typename T>
T ReadValue(FILE* file, bool wrongEndian) {
    T value;
    ReadBytes(reinterpret_cast<char*>(&value), sizeof(T), file, kShortReadMessage);
    if (wrongEndian) SwapBytes(value);
    return value;
}

}  // namespace HelperFunctions
