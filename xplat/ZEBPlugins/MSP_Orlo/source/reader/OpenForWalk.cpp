#include "reader/OpenForWalk.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <memory>
#include <new>

namespace HelperFunctions {

namespace {

// Where the walk lands it reads a header and a few fields, so it takes only
// this much there: copying bytes out of the page cache costs as much as the
// call.
constexpr size_t kLanding = 4 << 10;
// Reading on where the last read ended (samples walked as chunks, a large
// document) fills the whole block.
constexpr size_t kBlockSize = 64 << 10;

// The stream's buffer is the block, so bytes read once are still there after
// a seek that stdio answers by dropping its buffer.
struct PositionedFile {
    PositionedFile(int descriptor, off64_t size) : descriptor(descriptor), size(size) {}

    int descriptor;
    off64_t size;
    off64_t position = 0;
    std::unique_ptr<char[]> block{new (std::nothrow) char[kBlockSize]};
    // The file's bytes from blockStart on stand at the start of the block.
    off64_t blockStart = 0;
    size_t blockLength = 0;
};

ssize_t Advance(PositionedFile& file, ssize_t got) {
    if (got > 0) file.position += got;
    return got;
}

ssize_t Read(void* cookie, char* buffer, size_t size) {
    auto& file = *static_cast<PositionedFile*>(cookie);
    const off64_t blockEnd = file.blockStart + static_cast<off64_t>(file.blockLength);
    // stdio fills only its buffer; anything else is read as asked.
    if (buffer != file.block.get()) return Advance(file, pread(file.descriptor, buffer, size, file.position));
    if (file.position >= file.blockStart && file.position < blockEnd) {
        const size_t skipped = static_cast<size_t>(file.position - file.blockStart);
        file.blockLength -= skipped;
        std::memmove(buffer, buffer + skipped, file.blockLength);
    } else {
        const bool onward = file.blockLength > 0 && file.position == blockEnd;
        const ssize_t got = pread(file.descriptor, buffer, onward ? size : std::min(size, kLanding), file.position);
        file.blockLength = got > 0 ? static_cast<size_t>(got) : 0;
        if (got <= 0) return got;
    }
    file.blockStart = file.position;
    // A short read is no end of file: stdio asks again for the rest.
    return Advance(file, static_cast<ssize_t>(file.blockLength));
}

// As lseek on a regular file: any position from 0 on, past the end too.
int Seek(void* cookie, off64_t* offset, int whence) {
    auto& file = *static_cast<PositionedFile*>(cookie);
    off64_t base = 0;
    if (whence == SEEK_CUR) {
        base = file.position;
    } else if (whence == SEEK_END) {
        base = file.size;
    } else if (whence != SEEK_SET) {
        errno = EINVAL;
        return -1;
    }
    off64_t target = 0;
    if (__builtin_add_overflow(base, *offset, &target)) {
        errno = EOVERFLOW;
        return -1;
    }
    if (target < 0) {
        errno = EINVAL;
        return -1;
    }
    file.position = *offset = target;
    return 0;
}

int Close(void* cookie) {
    auto* file = static_cast<PositionedFile*>(cookie);
    const int closed = close(file->descriptor);
    delete file;
    return closed;
}

FILE* OverBlock(PositionedFile* file) {
    if (!file->block) return nullptr;
    FILE* stream = fopencookie(file, "r", {Read, nullptr, Seek, Close});
    // Without the block as its buffer the stream still reads, only uncached.
    if (stream) setvbuf(stream, file->block.get(), _IOFBF, kBlockSize);
    return stream;
}

}  // namespace

FILE* OpenForWalk(const char* path) {
    const int descriptor = open(path, O_RDONLY);
    if (descriptor < 0) return nullptr;
    struct stat status;
    if (fstat(descriptor, &status) == 0 && S_ISREG(status.st_mode)) {
        if (auto* file = new (std::nothrow) PositionedFile(descriptor, status.st_size)) {
            if (FILE* stream = OverBlock(file)) return stream;
            delete file;
        }
    }
    FILE* stream = fdopen(descriptor, "r");
    if (!stream) close(descriptor);
    return stream;
}

}  // namespace HelperFunctions
