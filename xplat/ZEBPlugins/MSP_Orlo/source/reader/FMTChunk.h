#pragma once
/// The WAVE `fmt ` chunk: the sample format.
#include <cstdint>

#include "reader/Chunk.h"

namespace Chunks {
namespace FMT {

class FMTChunk : public Chunk {
public:
    /// This parser's bit in the stream's chunk masks.
    static constexpr unsigned int kMaskBit = 1u << 1;

    /// Accepts compression codes 1 (PCM), 3 (float) and 0xFFFE (extensible
    /// with sub-format 1 or 3, or with a short extension that names none).
    bool InitChunkFromStream(const ChunkHeader_t& header, FILE* file, bool wrongEndian) override;

    uint16_t GetCompressionCode() const { return m_CompressionCode; }
    uint16_t GetChannelCount() const { return m_ChannelCount; }
    uint32_t GetSampleRate() const { return m_SampleRate; }
    uint32_t GetAverageBPS() const { return m_AverageBPS; }
    uint16_t GetBlockAlign() const { return m_BlockAlign; }
    uint16_t GetBitsPerSample() const { return m_BitsPerSample; }
    /// The first two bytes of the extensible format's sub-format; 0 when absent.
    uint16_t GetSubFormatCode() const { return m_SubFormatCode; }

    bool IsPCM() const;
    bool IsFloatingPoint() const;

private:
    uint16_t m_CompressionCode = 0;
    uint16_t m_ChannelCount = 0;
    uint32_t m_SampleRate = 0;
    uint32_t m_AverageBPS = 0;
    uint16_t m_BlockAlign = 0;
    uint16_t m_BitsPerSample = 0;
    uint16_t m_SubFormatCode = 0;
};

}  // namespace FMT
}  // namespace Chunks
