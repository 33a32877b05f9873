#include "identity/GenerateUMIDFromFileContent.h"

#include <sys/stat.h>

#include <cstdio>
#include <cstring>
#include <memory>

#include "identity/CreateUIDGenerator.h"
#include "startup/ZEBUtilLib.h"
#include "strings/ZEBString.h"
#include "tov/sdk/TOVFailureStyle.h"

namespace ZEB {
namespace {

constexpr off_t kBlockSize = 0x400000;

struct FileCloser {
    void operator()(std::FILE* file) const { std::fclose(file); }
};
using File = std::unique_ptr<std::FILE, FileCloser>;

// Short reads are not failures: whatever was read goes to the digest.
unsigned int ReadBlock(std::FILE* file, off_t offset, unsigned char* buffer) {
    if (fseeko(file, offset, SEEK_SET) != 0) return 0;
    return static_cast<unsigned int>(std::fread(buffer, 1, kBlockSize, file));
}

TOVRESULT DigestFile(ITOVString* pathText, _aafUID_t* out) {
    TOVPtr<ITOVUIDGeneratorMD5> generator;
    TOVCheck(CreateUIDGenerator(generator));
    std::memset(out, 0, sizeof *out);
    const ZEBString utf8(kTOVUnicodeUTF8, pathText);
    const char* path = reinterpret_cast<const char*>(utf8.GetUTF8String());
    const File file(std::fopen(path, "rb"));
    if (!file) return TOV_E_FILEOPEN;
    // A size that cannot be read counts as a file that cannot be opened.
    struct stat info {};
    if (stat(path, &info) != 0) return TOV_E_FILEOPEN;
    ITOVUIDGeneratorMD5& digest = *generator;
    const std::unique_ptr<unsigned char[]> buffer(new unsigned char[kBlockSize]);

    void* context = nullptr;
    const TOVRESULT begun = digest.Begin(&context);
    const unsigned int first = ReadBlock(file.get(), 0, buffer.get());
    if (TOVFailed(begun)) return begun;
    TOVRESULT result = digest.AddData(context, buffer.get(), first);
    if (TOVFailed(result)) return result;
    if (info.st_size >= 2 * kBlockSize + 1) {
        const unsigned int middle = ReadBlock(file.get(), (info.st_size - kBlockSize) / 2, buffer.get());
        result = digest.AddData(context, buffer.get(), middle);
        if (TOVFailed(result)) return result;
    }
    if (info.st_size >= kBlockSize + 1) {
        const unsigned int last = ReadBlock(file.get(), info.st_size - kBlockSize, buffer.get());
        result = digest.AddData(context, buffer.get(), last);
        if (TOVFailed(result)) return result;
    }
    return digest.Finish(out, &context);
}

}  // namespace

TOVRESULT GenerateUMIDFromFileContent(ITOVString* path, _aafUID_t* out) {
    if (!path || !out || path->GetNumCharacters() == 0) return TOV_E_INVALIDARG;
    if (!ZEBUtilLib::gpComponentFactory) return ZEB_E_NOTREADY;
    try {
        return DigestFile(path, out);
    } catch (...) {
        // Every failure that arrives as an exception, a failed creation of the
        // generator included, is reported alike.
        return TOV_E_UNEXPECTED;
    }
}

}  // namespace ZEB
