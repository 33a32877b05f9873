#pragma once
/// The WAVE `data` chunk: where the samples lie and how many there are. The
/// walk seeks over the samples, never reads them.
#include <cstdint>

#include "reader/Chunk.h"

namespace Orlo {
class OrloStream;
}

namespace Chunks {
namespace DATA {

class DATAChunk : public Chunk {
public:
    /// This parser's bit in the stream's chunk masks.
    static constexpr unsigned int kMaskBit = 1u << 2;

    /// `stream` is not owned; it owns this parser and outlives it.
    explicit DATAChunk(Orlo::OrloStream* stream) : m_Stream(stream) {}

    /// Takes the size from `ds64` in an RF64 file, and cuts it to the bytes
    /// that the file really holds.
    bool InitChunkFromStream(const ChunkHeader_t& header, FILE* file, bool wrongEndian) override;

    /// Sample size = whole bytes of `bits`; the count follows from the data
    /// size, or the data size from the count when the size is 0. A frame size
    /// of 0 throws a text (see the source for which).
    void CalculateSampleSizeAndCount(uint16_t bits, uint16_t channels);

    int64_t GetMediaStartPos() const { return m_MediaStartPos; }
    uint16_t GetSampleSize() const { return m_SampleSize; }
    uint64_t GetSampleCount() const { return m_SampleCount; }
    uint64_t GetDataSize() const { return m_DataSize; }
    bool IsDataWrongEndian() const { return m_DataWrongEndian; }
    void SetDataWrongEndian(bool wrongEndian) { m_DataWrongEndian = wrongEndian; }

private:
    int64_t m_MediaStartPos = 0;
    uint16_t m_SampleSize = 0;
    uint64_t m_SampleCount = 0;
    uint64_t m_DataSize = 0;
    bool m_DataWrongEndian = false;
    Orlo::OrloStream* m_Stream;
};

}  // namespace DATA
}  // namespace Chunks
