#pragma once
/// Opening the file that a chunk walk reads.
#include <cstdio>

namespace HelperFunctions {

/// `path` opened for reading as a stdio stream, or null where fopen would
/// fail. The walk seeks, asks for its position and reads a few bytes at every
/// chunk, and on a plain stream each of those is a system call, the first
/// read after a seek one more. So a regular file is read through a block of
/// its bytes kept with the stream, refilled by one positioned read where the
/// walk leaves it, and the stream keeps its position and the size it found
/// when it opened. Anything else (a pipe, a device, a directory) is the plain
/// stream. fclose releases either.
FILE* OpenForWalk(const char* path);

}  // namespace HelperFunctions
