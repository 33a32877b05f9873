#include "reader/CalcBytesRemaining.h"

#include <sys/types.h>

namespace Chunks {

int64_t CalcBytesRemaining(const char*, FILE* file) {
    const char* const kNoSize = "Unable to get file-size from filesystem.";
    const off_t here = ftello(file);
    if (here < 0 || fseeko(file, 0, SEEK_END) != 0) throw kNoSize;
    const off_t end = ftello(file);
    if (fseeko(file, here, SEEK_SET) != 0 || end < here) throw kNoSize;
    return end - here;
}

}  // namespace Chunks
