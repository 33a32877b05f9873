#include "reader/DATAChunk.h"

#include <exception>

#include "reader/DS64Chunk.h"
#include "reader/OrloStream.h"
#include "reader/StreamErrors.h"

namespace Chunks {
namespace DATA {

bool DATAChunk::InitChunkFromStream(const ChunkHeader_t& header, FILE* file, bool) {
    try {
        m_MediaStartPos = ftello(file);
        m_Header = header;
        // An RF64 writer leaves 0xFFFFFFFF in the 32-bit field; the real size
        // stands in ds64, and an RF64 file without one has no data.
        m_DataSize = m_Stream->IsRF64() ? m_Stream->GetChunk<DS64::DS64Chunk>()->GetDataSize() : header.chunkSize;
        // A file cut off while recording, or a size field never updated, claims
        // more than is there: keep the samples that are.
        const int64_t remaining = m_Stream->GetBytesRemaining();
        if (remaining >= 0 && m_DataSize > static_cast<uint64_t>(remaining)) m_DataSize = remaining;
        // This seek, not the chunk size, moves the walk on: it is what carries
        // an RF64 file past its 4 GiB size field.
        const int64_t end = m_MediaStartPos + static_cast<int64_t>(m_DataSize);
        if (end >= 1) fseeko(file, end, SEEK_SET);
        return true;
    } catch (const std::exception&) {
        return false;
    }
}

void DATAChunk::CalculateSampleSizeAndCount(uint16_t bits, uint16_t channels) {
    m_SampleSize = static_cast<uint16_t>((bits + 7) / 8);
    const uint64_t frameBytes = uint64_t{m_SampleSize} * channels;
    // Zero bits or zero channels give no frame to divide by. Zero bits would
    // fail the width check after the walk anyway, so they fail with its text
    // now; zero channels get a text of their own.
    if (m_SampleSize == 0) throw Orlo::kUnsupportedBitsError;
    if (frameBytes == 0) throw Orlo::kNoChannelsError;
    if (m_DataSize != 0) {
        m_SampleCount = m_DataSize / frameBytes;
    } else if (m_SampleCount != 0) {
        m_DataSize = m_SampleCount * frameBytes;
    }
}

}  // namespace DATA
}  // namespace Chunks
