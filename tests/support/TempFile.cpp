#include "TempFile.h"

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
