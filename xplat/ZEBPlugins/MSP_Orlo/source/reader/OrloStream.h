#pragma once
/// One pass over an audio file's chunks. The constructor opens the file, hands
/// each recognised chunk to its parser, checks the sample format and closes
/// the file again; afterwards the stream answers from the parsed chunks alone.
#include <cstdint>
#include <cstdio>
#include <map>
#include <memory>
#include <string>

#include "reader/Chunk.h"

namespace Chunks {
namespace DS64 {
class DS64Chunk;
}
namespace FMT {
class FMTChunk;
}
namespace DATA {
class DATAChunk;
}
namespace BEXT {
class BEXTChunk;
}
namespace IXML {
class IXMLChunk;
}
namespace UMID {
class UMIDChunk;
}
namespace COMM {
class COMMChunk;
}
namespace SSND {
class SSNDChunk;
}
}  // namespace Chunks

namespace Orlo {

class OrloStream {
public:
    /// One bit per chunk type with a parser: a mask of accepted chunks and the
    /// keys of the chunk table.
    enum SupportedChunks : unsigned int {
        DS64_CHUNK = 1,
        FMT_CHUNK = 2,
        DATA_CHUNK = 4,
        BEXT_CHUNK = 8,
        IXML_CHUNK = 16,
        UMID_CHUNK = 32,
        COMM_CHUNK = 64,
        SSND_CHUNK = 128,
    };

    /// Walks the file at `path` (UTF-8). Never throws for a bad file: read the
    /// outcome from GetError(). Any `chunks` other than 0 reads all chunks.
    OrloStream(const char* path, unsigned int chunks);

    OrloStream(const OrloStream&) = delete;
    OrloStream& operator=(const OrloStream&) = delete;

    /// Why the stream failed, as static text; null when it did not.
    const char* GetError() const { return m_Error; }
    /// True when any bit of `chunks` was accepted.
    bool HasChunk(unsigned int chunks) const { return (m_ChunksSeen & chunks) != 0; }
    /// The parser of class T, accepted or not; null for a chunk type whose
    /// parser is not in the table. Shared with the stream.
    template <typename T>
    std::shared_ptr<T> GetChunk() const;

    std::string GetFullFileName() const { return m_FullFileName; }
    bool IsFileWrongEndian() const { return m_FileWrongEndian; }
    void SetIsFileWrongEndian(bool wrongEndian) { m_FileWrongEndian = wrongEndian; }
    /// The outer frame is "RF64".
    bool IsRF64() const { return m_RF64; }

    // From `fmt ` when accepted, else from `COMM`; with neither accepted each
    // of these throws std::logic_error("value does not exist").
    uint16_t GetChannelCount() const;
    uint16_t GetBitsPerSample() const;
    bool GetIsDataFloatingPoint() const;
    double GetSampleRate() const;
    // From `data` when accepted, else from `COMM`.
    uint64_t GetSampleCount() const;
    bool GetIsDataWrongEndian() const;
    // From `data` when accepted, else from `SSND`.
    uint16_t GetSampleSize() const;
    int64_t GetStartPosition() const;
    /// Start position + sample size × sample × channel count.
    int64_t GetSamplePosition(unsigned long long sample) const;

    /// File size − current position while the file is open; -1 once it is
    /// closed. A file size below 1 throws the text "Missing file-size attribute
    /// from file system.".
    int64_t GetBytesRemaining() const;

private:
    void ReadAndParseFile(unsigned int chunks);
    bool ReadChunkHeader(Chunks::ChunkHeader_t* header);
    void ReadAndInitChunk(Chunks::ChunkHeader_t header);
    void ReadFourBytes(char* out, const std::string& message);
    void SkipEmptyChunks();
    /// The value `get` takes from parser First if accepted, else from Second;
    /// neither throws std::logic_error("value does not exist").
    template <typename First, typename Second, typename Value, typename Get>
    Value FromFirstAccepted(Get get) const;

    bool m_FileWrongEndian = false;
    bool m_RF64 = false;
    int64_t m_FileSize = -1;
    const char* m_Error = nullptr;
    FILE* m_File = nullptr;
    std::string m_FullFileName;
    uint16_t m_ChunksSeen = 0;
    std::map<SupportedChunks, std::shared_ptr<Chunks::Chunk>> m_ChunkTable;
};

/// The table key of each parser class.
template <typename T>
struct ChunkKey;
template <>
struct ChunkKey<Chunks::DS64::DS64Chunk> {
    static constexpr OrloStream::SupportedChunks value = OrloStream::DS64_CHUNK;
};
template <>
struct ChunkKey<Chunks::FMT::FMTChunk> {
    static constexpr OrloStream::SupportedChunks value = OrloStream::FMT_CHUNK;
};
template <>
struct ChunkKey<Chunks::DATA::DATAChunk> {
    static constexpr OrloStream::SupportedChunks value = OrloStream::DATA_CHUNK;
};
template <>
struct ChunkKey<Chunks::BEXT::BEXTChunk> {
    static constexpr OrloStream::SupportedChunks value = OrloStream::BEXT_CHUNK;
};
template <>
struct ChunkKey<Chunks::IXML::IXMLChunk> {
    static constexpr OrloStream::SupportedChunks value = OrloStream::IXML_CHUNK;
};
template <>
struct ChunkKey<Chunks::UMID::UMIDChunk> {
    static constexpr OrloStream::SupportedChunks value = OrloStream::UMID_CHUNK;
};
template <>
struct ChunkKey<Chunks::COMM::COMMChunk> {
    static constexpr OrloStream::SupportedChunks value = OrloStream::COMM_CHUNK;
};
template <>
struct ChunkKey<Chunks::SSND::SSNDChunk> {
    static constexpr OrloStream::SupportedChunks value = OrloStream::SSND_CHUNK;
};

template <typename T>
std::shared_ptr<T> OrloStream::GetChunk() const {
    const auto found = m_ChunkTable.find(ChunkKey<T>::value);
    return found == m_ChunkTable.end() ? nullptr : std::static_pointer_cast<T>(found->second);
}

}  // namespace Orlo
