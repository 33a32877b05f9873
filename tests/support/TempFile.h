#pragma once
/// A file in the temporary folder holding given bytes, removed again when the
/// object goes.
#include <cstdint>
#include <string>

class TempFile {
public:
    explicit TempFile(const std::string& bytes);
    ~TempFile();
    TempFile(const TempFile&) = delete;
    TempFile& operator=(const TempFile&) = delete;

    const std::string& Path() const { return m_Path; }
    /// Writes `bytes` at `offset`; writing past the end leaves a hole, so large
    /// files cost no disk.
    void WriteAt(uint64_t offset, const std::string& bytes);
    /// Cuts or extends the file to `size` bytes; an extension is a hole.
    void Resize(uint64_t size);

private:
    std::string m_Path;
};
