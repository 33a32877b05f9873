#pragma once
/// A file in the temporary folder holding given bytes, removed again when the
/// object goes.
#include <string>

class TempFile {
public:
    explicit TempFile(const std::string& bytes);
    ~TempFile();
    TempFile(const TempFile&) = delete;
    TempFile& operator=(const TempFile&) = delete;

    const std::string& Path() const { return m_Path; }

private:
    std::string m_Path;
};
