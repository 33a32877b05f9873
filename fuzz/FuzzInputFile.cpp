#include "FuzzInputFile.h"

#include <sys/mman.h>
#include <unistd.h>

#include <cstdlib>

FuzzInputFile::FuzzInputFile(const char* name) : m_Descriptor(memfd_create(name, 0)) {
    if (m_Descriptor < 0) std::abort();
    m_Path = "/proc/self/fd/" + std::to_string(m_Descriptor);
}

void FuzzInputFile::Write(const uint8_t* data, size_t size) {
    if (ftruncate(m_Descriptor, 0) != 0) std::abort();
    if (size > 0 && pwrite(m_Descriptor, data, size, 0) != static_cast<ssize_t>(size)) std::abort();
}
