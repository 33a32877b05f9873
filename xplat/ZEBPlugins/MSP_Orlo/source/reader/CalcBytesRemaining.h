#pragma once
/// How much of a file lies after the current position.
#include <cstdint>
#include <cstdio>

namespace Chunks {

/// Bytes from the current position to the end, found by seeking to the end and
/// back. Throws the text "Unable to get file-size from filesystem." when a
/// position cannot be read or the end lies before the current position.
/// `path` is not used: the open file alone answers.
int64_t CalcBytesRemaining(const char* path, FILE* file);

}  // namespace Chunks
