#pragma once
/// A file in memory that each fuzz input is written to, so that the code under
/// test opens it by path as it opens any file.
#include <cstddef>
#include <cstdint>
#include <string>

class FuzzInputFile {
public:
    /// Aborts when the memory file cannot be made.
    explicit FuzzInputFile(const char* name);
    FuzzInputFile(const FuzzInputFile&) = delete;
    FuzzInputFile& operator=(const FuzzInputFile&) = delete;

    /// Replaces the file's bytes by the input; aborts when that fails.
    void Write(const uint8_t* data, size_t size);
    const std::string& Path() const { return m_Path; }

private:
    int m_Descriptor = -1;
    std::string m_Path;
};
