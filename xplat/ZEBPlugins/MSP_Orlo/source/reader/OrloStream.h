#pragma once
/// One pass over an audio file's chunks. The constructor opens the file, hands
/// each recognised chunk to its parser, checks the sample format and closes
/// the file again; afterwards the stream answers from the parsed chunks alone.
#include <cstdint>
#include <cstdio>
#include <map>
#include <memory>
#include <string>

#include "reader/ChunkTable.h"

namespace Orlo {

class OrloStream {
public:
    /// Names for the parsers' bits. A mask of chunks is any OR of the bits of
    /// kChunkTable's rows; kAllChunks holds them all.
    enum SupportedChunks : unsigned int {
        DS64_CHUNK = Chunks::DS64::DS64Chunk::kMaskBit,
        FMT_CHUNK = Chunks::FMT::FMTChunk::kMaskBit,
        DATA_CHUNK = Chunks::DATA::DATAChunk::kMaskBit,
        BEXT_CHUNK = Chunks::BEXT::BEXTChunk::kMaskBit,
        IXML_CHUNK = Chunks::IXML::IXMLChunk::kMaskBit,
        UMID_CHUNK = Chunks::UMID::UMIDChunk::kMaskBit,
        COMM_CHUNK = Chunks::COMM::COMMChunk::kMaskBit,
        SSND_CHUNK = Chunks::SSND::SSNDChunk::kMaskBit,
    };

    /// Walks the file at `path` (UTF-8). Never throws for a bad file: read the
    /// outcome from GetError(). Any `chunks` other than 0 reads all chunks; pass
    /// kAllChunks.
    OrloStream(const char* path, unsigned int chunks);

    OrloStream(const OrloStream&) = delete;
    OrloStream& operator=(const OrloStream&) = delete;

    /// Why the stream failed, as static text; null when it did not.
    const char* GetError() const { return m_Error; }
    /// True when any bit of `chunks` was accepted.
    bool HasChunk(unsigned int chunks) const { return (m_ChunksSeen & chunks) != 0; }
    /// The parser of class T, accepted or not; null for a parser class that
    /// has no row in kChunkTable. Shared with the stream.
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
    unsigned int m_ChunksSeen = 0;
    /// One parser per row of kChunkTable, by its bit.
    std::map<unsigned int, std::shared_ptr<Chunks::Chunk>> m_Parsers;
};

template <typename T>
std::shared_ptr<T> OrloStream::GetChunk() const {
    const auto found = m_Parsers.find(T::kMaskBit);
    return found == m_Parsers.end() ? nullptr : std::static_pointer_cast<T>(found->second);
}

}  // namespace Orlo
