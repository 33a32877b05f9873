#include "TempFile.h"

#include <fcntl.h>
#include <unistd.h>

#include <cstdlib>
#include <stdexcept>

TempFile::TempFile(const std::string& bytes) {
    const char* folder = std::getenv("TMPDIR");
    std::string pattern = std::string(folder && *folder ? folder : "/tmp") + "/orlo-test-XXXXXX";
    const int fd = mkstemp(pattern.data());
    if (fd < 0) throw std::runtime_error("cannot make a temporary file");
    m_Path = pattern;
    const bool written = write(fd, bytes.data(), bytes.size()) == static_cast<ssize_t>(bytes.size());
    close(fd);
    if (!written) {
        unlink(m_Path.c_str());
        throw std::runtime_error("cannot write a temporary file");
    }
}

TempFile::~TempFile() { unlink(m_Path.c_str()); }

void TempFile::WriteAt(uint64_t offset, const std::string& bytes) {
    const int fd = open(m_Path.c_str(), O_WRONLY);
    if (fd < 0) throw std::runtime_error("cannot open a temporary file");
    const bool written =
        pwrite(fd, bytes.data(), bytes.size(), static_cast<off_t>(offset)) == static_cast<ssize_t>(bytes.size());
    close(fd);
    if (!written) throw std::runtime_error("cannot write a temporary file");
}

void TempFile::Resize(uint64_t size) {
    if (truncate(m_Path.c_str(), static_cast<off_t>(size)) != 0)
        throw std::runtime_error("cannot resize a temporary file");
}
