#pragma once
/// The AIFF and AIFF-C `COMM` chunk: the sample format. What its payload holds
/// decides the format, not the form type.
#include <cstdint>
#include <string>

#include "reader/Chunk.h"

namespace Chunks {
namespace COMM {

/// AIFF-C's little-endian integer PCM.
inline constexpr char kSowt[] = "sowt";

class COMMChunk : public Chunk {
public:
    /// This parser's bit in the stream's chunk masks.
    static constexpr unsigned int kMaskBit = 1u << 6;

    /// Accepts a chunk of at least 18 bytes. Throws a text for "fl64" and for
    /// a compression type it does not know.
    bool InitChunkFromStream(const ChunkHeader_t& header, FILE* file, bool wrongEndian) override;

    uint16_t GetChannelCount() const { return m_ChannelCount; }
    uint32_t GetSampleCount() const { return m_SampleCount; }
    uint16_t GetBitsPerSample() const { return m_BitsPerSample; }
    double GetSampleRate() const { return m_SampleRate; }
    /// Four characters, or empty when the chunk has none.
    std::string GetCompressionType() const { return m_CompressionType; }
    bool IsDataWrongEndian() const { return m_DataWrongEndian; }
    void SetDataWrongEndian(bool wrongEndian) { m_DataWrongEndian = wrongEndian; }
    bool IsFloatingPoint() const { return m_FloatingPoint; }

private:
    void ApplyCompressionType();

    uint16_t m_ChannelCount = 0;
    uint32_t m_SampleCount = 0;
    uint16_t m_BitsPerSample = 0;
    double m_SampleRate = 0.0;
    std::string m_CompressionType;
    bool m_DataWrongEndian = false;
    bool m_FloatingPoint = false;
};

}  // namespace COMM
}  // namespace Chunks
