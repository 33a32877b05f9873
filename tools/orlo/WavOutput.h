#pragma once
/// A standard little-endian WAV file written as frames arrive: plain RIFF,
/// or RF64 with a ds64 chunk when the data would not fit the 32-bit sizes.
/// The whole size is known before the first frame, so the header is final.
#include <cstdint>
#include <cstdio>
#include <string>

class WavOutput {
public:
    struct Format {
        uint16_t channels;
        uint32_t rate;
        uint16_t bits;
        bool floating;
    };

    /// Opens `path` and writes the header for `frames` frames of `format`.
    /// On failure `Error()` says why.
    WavOutput(const std::string& path, const Format& format, uint64_t frames);
    ~WavOutput();

    WavOutput(const WavOutput&) = delete;
    WavOutput& operator=(const WavOutput&) = delete;

    /// Appends interleaved little-endian sample bytes.
    bool Write(const unsigned char* bytes, size_t size);
    /// Flushes and closes; false when anything failed.
    bool Close();
    const std::string& Error() const { return m_Error; }

private:
    bool Fail(const std::string& what);

    std::FILE* m_File = nullptr;
    std::string m_Path;
    std::string m_Error;
    /// An odd data size takes a pad byte at the end.
    bool m_Pad = false;
};
