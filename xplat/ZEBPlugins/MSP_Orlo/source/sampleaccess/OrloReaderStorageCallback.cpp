#include "sampleaccess/OrloReaderStorageCallback.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>

#include "boundary/ModuleGlobals.h"
#include "tov/sdk/TOVFailureStyle.h"

namespace ZEB {
namespace Impl {

OrloReaderStorageCallback::OrloReaderStorageCallback(const ZEBString& path) : CTOVUnknown(nullptr), m_Path(path) {}

OrloReaderStorageCallback::~OrloReaderStorageCallback() {
    if (m_FileDescriptor == 0) return;
    const int closed = close(m_FileDescriptor);
    const int error = errno;
    m_FileDescriptor = 0;
    if (closed == 0) return;
    try {
        g_logger.Write(kTOVDebugLevelError, "OrloReaderStorageCallback error. fclose failed. errno = %d %s(%d)", error,
                       __FILE__, __LINE__);
    } catch (...) {
    }
}

std::string OrloReaderStorageCallback::Utf8Path() const {
    ZEBString utf8(m_Path);
    utf8.ConvertTo(kTOVUnicodeUTF8);
    return reinterpret_cast<const char*>(utf8.GetUTF8String());
}

void OrloReaderStorageCallback::init() {
    if (m_FileDescriptor != 0) return;
    const std::string path = Utf8Path();
    m_FileDescriptor = open(path.c_str(), O_RDONLY);
    if (m_FileDescriptor == 0) {
        const int error = errno;
        g_logger.Write(kTOVDebugLevelError, "OrloReaderStorageCallback error. fopen failed. errno = %d %s(%d)", error,
                       __FILE__, __LINE__);
        throw static_cast<int>(TOV_E_FILEIO);
    }
}

TOVRESULT OrloReaderStorageCallback::GetLength(unsigned long long* out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_POINTER;
        if (m_Length != 0) {
            *out = m_Length;
            return TOV_OK;
        }
        init();
        if (m_FileDescriptor == 0) return TOV_E_FILEIO;
        const std::string path = Utf8Path();
        struct stat info;
        if (stat(path.c_str(), &info) != 0) {
            const int error = errno;
            g_logger.Write(kTOVDebugLevelError, "OrloReaderStorageCallback error. stat64 failed. errno = %d %s(%d)",
                           error, __FILE__, __LINE__);
            return TOV_E_FILEIO;
        }
        m_Length = static_cast<uint64_t>(info.st_size);
        *out = m_Length;
        return TOV_OK;
    });
}

TOVRESULT OrloReaderStorageCallback::Read(unsigned long long offset, unsigned char* buffer, unsigned int size) {
    return TOVGuarded([&] {
        if (!buffer) return TOV_E_POINTER;
        init();
        if (m_FileDescriptor == 0) return TOV_E_FILEIO;
        const ssize_t read = pread(m_FileDescriptor, buffer, size, static_cast<off_t>(offset));
        if (read == -1) {
            // The text names another component and call; logs are compared by it.
            g_logger.Write(kTOVDebugLevelWarning,
                           "XDCAMSampleMapping error. fread did not read requested bytes. nitemsRead = %d %s(%d)",
                           static_cast<int>(read), __FILE__, __LINE__);
            return TOV_E_FILEIO;
        }
        return TOV_OK;
    });
}

}  // namespace Impl
}  // namespace ZEB
