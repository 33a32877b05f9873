#pragma once
/// Payloads of the chunks that the reader parses, laid out as a writer would:
/// WAVE chunks little-endian, AIFF chunks big-endian.
#include <cstdint>
#include <string>

namespace Payload {

struct Fmt {
    uint16_t code = 1;  ///< 1 PCM, 3 float, 0xFFFE extensible
    uint16_t channels = 2;
    uint32_t rate = 48000;
    uint16_t bits = 24;
    /// Extensible only: the extension size written (22 in a proper file) and
    /// the sub-format code; the payload holds min(size, 22) extension bytes.
    uint16_t extensionSize = 22;
    uint16_t subFormat = 1;
};
/// 16 bytes, or 18 + the extension for code 0xFFFE.
std::string FmtChunk(const Fmt& fmt);

/// 28 bytes plus 12 per table entry.
std::string Ds64Chunk(uint64_t riffSize, uint64_t dataSize, uint64_t sampleCount, uint32_t tableLength = 0);

struct Comm {
    uint16_t channels = 2;
    uint32_t frames = 0;
    uint16_t bits = 16;
    double rate = 48000.0;
    /// Empty: a plain AIFF COMM of 18 bytes. Else the type and a name.
    std::string compression;
    std::string compressionName = "not compressed";
};
std::string CommChunk(const Comm& comm);

/// Offset, block size, then the sample bytes.
std::string SsndChunk(uint32_t offset, const std::string& samples);

struct Bext {
    std::string description;
    std::string originator = "Orlo tests";
    std::string originatorReference;
    std::string originationDate = "2024-05-17";
    std::string originationTime = "13:45:10";
    uint64_t timeReference = 0;
    uint16_t version = 1;
    std::string umid;  ///< up to 64 bytes; version 1 and 2 only
    int16_t loudness[5] = {};
    std::string codingHistory;
};
/// The 602-byte fixed part laid out for the version, then the coding history.
std::string BextChunk(const Bext& bext);

}  // namespace Payload
