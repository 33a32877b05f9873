#include "reader/ReadBytes.h"

#include <algorithm>

namespace HelperFunctions {

namespace {
const char* const kInvalidCount = "ReadBytes() -- invalid number of bytes to read!";
// A size field can claim up to 4 GiB in a file of a few bytes: the string grows
// by at most this much per read, so memory follows what the file really holds.
constexpr size_t kPiece = 1 << 20;

// Room for what the read can find: `count`, or the rest of the file when that
// is less. Made once, so that a large chunk is neither moved nor held twice
// while the string grows to it.
void Reserve(std::string& out, size_t count, FILE* file) {
    const off_t here = ftello(file);
    if (here < 0 || fseeko(file, 0, SEEK_END) != 0) return;
    const off_t end = ftello(file);
    if (fseeko(file, here, SEEK_SET) != 0 || end < here) return;
    out.reserve(std::min(count, static_cast<size_t>(end - here)));
}
}  // namespace

void ReadBytes(char* buffer, size_t count, FILE* file, const std::string& message) {
    if (count == 0) throw kInvalidCount;
    if (std::fread(buffer, 1, count, file) != count) throw message;
}

void ReadBytes(std::string& out, size_t count, FILE* file, const std::string& message) {
    if (count == 0) throw kInvalidCount;
    out.clear();
    if (count > kPiece) Reserve(out, count, file);
    while (out.size() < count) {
        const size_t done = out.size();
        const size_t piece = std::min(kPiece, count - done);
        out.resize(done + piece);
        if (std::fread(&out[done], 1, piece, file) != piece) throw message;
    }
}

}  // namespace HelperFunctions
