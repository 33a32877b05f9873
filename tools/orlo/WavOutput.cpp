#include "WavOutput.h"

#include <cerrno>
#include <cstring>

namespace {

void Put(std::string& out, uint64_t value, int bytes) {
    for (int i = 0; i < bytes; ++i) out.push_back(static_cast<char>((value >> (8 * i)) & 0xFF));
}

}  // namespace

WavOutput::WavOutput(const std::string& path, const Format& format, uint64_t frames) : m_Path(path) {
    const uint32_t frameBytes = static_cast<uint32_t>(format.channels) * (format.bits / 8u);
    const uint64_t dataSize = frames * frameBytes;
    const bool pad = dataSize % 2 != 0;
    // fmt (16) and data headers; RF64 adds a ds64 chunk of 28 bytes.
    const uint64_t riffSize = 4 + (8 + 16) + (8 + dataSize + (pad ? 1 : 0));
    const bool rf64 = riffSize + 8 + 36 > 0xFFFFFFFFull;
    std::string header;
    header += rf64 ? "RF64" : "RIFF";
    Put(header, rf64 ? 0xFFFFFFFFull : riffSize, 4);
    header += "WAVE";
    if (rf64) {
        header += "ds64";
        Put(header, 28, 4);
        Put(header, riffSize + 36, 8);
        Put(header, dataSize, 8);
        Put(header, frames, 8);
        Put(header, 0, 4);
    }
    header += "fmt ";
    Put(header, 16, 4);
    Put(header, format.floating ? 3 : 1, 2);
    Put(header, format.channels, 2);
    Put(header, format.rate, 4);
    Put(header, static_cast<uint64_t>(format.rate) * frameBytes, 4);
    Put(header, frameBytes, 2);
    Put(header, format.bits, 2);
    header += "data";
    Put(header, rf64 ? 0xFFFFFFFFull : dataSize, 4);
    m_File = std::fopen(path.c_str(), "wb");
    if (!m_File) {
        Fail("cannot create");
        return;
    }
    if (std::fwrite(header.data(), 1, header.size(), m_File) != header.size()) Fail("cannot write");
    m_Pad = pad;
}

WavOutput::~WavOutput() {
    if (m_File) std::fclose(m_File);
}

bool WavOutput::Write(const unsigned char* bytes, size_t size) {
    if (!m_File || !m_Error.empty()) return false;
    if (std::fwrite(bytes, 1, size, m_File) != size) return Fail("cannot write");
    return true;
}

bool WavOutput::Close() {
    if (!m_File) return false;
    if (m_Error.empty() && m_Pad && std::fputc(0, m_File) == EOF) Fail("cannot write");
    const bool closed = std::fclose(m_File) == 0;
    m_File = nullptr;
    if (!closed && m_Error.empty()) Fail("cannot write");
    return m_Error.empty();
}

bool WavOutput::Fail(const std::string& what) {
    if (m_Error.empty()) m_Error = what + " " + m_Path + ": " + std::strerror(errno);
    return false;
}
