#pragma once
/// The RF64 `ds64` chunk: the 64-bit sizes that a 32-bit size field cannot hold.
#include <cstdint>

#include "reader/Chunk.h"

namespace Chunks {
namespace DS64 {

class DS64Chunk : public Chunk {
public:
    /// This parser's bit in the stream's chunk masks.
    static constexpr unsigned int kMaskBit = 1u << 0;

    /// Refuses a chunk whose data size and sample count are both 0. A chunk
    /// cut off by the end of the file is logged and refused.
    bool InitChunkFromStream(const ChunkHeader_t& header, FILE* file, bool wrongEndian) override;

    uint64_t GetSampleCount() const { return m_SampleCount; }
    uint64_t GetDataSize() const { return m_DataSize; }

private:
    uint64_t m_SampleCount = 0;
    uint64_t m_DataSize = 0;
};

}  // namespace DS64
}  // namespace Chunks
