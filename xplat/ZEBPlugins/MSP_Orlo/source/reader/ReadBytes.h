#pragma once
/// Exact reads from a file for the chunk parsers.
#include <cstddef>
#include <cstdio>
#include <string>

namespace HelperFunctions {

/// Reads exactly `count` bytes into `buffer`. A count of 0 throws the text
/// "ReadBytes() -- invalid number of bytes to read!"; a short read throws
/// `message` itself, as a std::string.
void ReadBytes(char* buffer, size_t count, FILE* file, const std::string& message);

/// As above, replacing the contents of `out` with the bytes read, zero bytes
/// included.
void ReadBytes(std::string& out, size_t count, FILE* file, const std::string& message);

}  // namespace HelperFunctions
