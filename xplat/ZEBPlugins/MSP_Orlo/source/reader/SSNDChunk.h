#pragma once
/// The AIFF `SSND` chunk: where the samples begin. Its size is never checked
/// against the file: the sample count stays that of `COMM`.
#include <cstdint>

#include "reader/Chunk.h"

namespace Chunks {
namespace SSND {

class SSNDChunk : public Chunk {
public:
    /// This parser's bit in the stream's chunk masks.
    static constexpr unsigned int kMaskBit = 1u << 7;

    /// Refuses a chunk under 8 bytes.
    bool InitChunkFromStream(const ChunkHeader_t& header, FILE* file, bool wrongEndian) override;
    /// Sample size = whole bytes of `bits`.
    void CalculateSampleSize(uint16_t bits) { m_SampleSize = static_cast<uint16_t>((bits + 7) / 8); }

    int64_t GetMediaStartPos() const { return m_MediaStartPos; }
    uint16_t GetSampleSize() const { return m_SampleSize; }

private:
    int64_t m_MediaStartPos = 0;
    uint16_t m_SampleSize = 0;
};

}  // namespace SSND
}  // namespace Chunks
