#include "reader/DS64Chunk.h"

#include "boundary/ModuleGlobals.h"
#include "reader/ReadValue.h"

namespace Chunks {
namespace DS64 {

bool DS64Chunk::InitChunkFromStream(const ChunkHeader_t& header, FILE* file, bool wrongEndian) {
    using HelperFunctions::ReadValue;
    try {
        m_Header = header;
        uint32_t left = header.chunkSize;
        uint64_t riffSize = 0;
        uint32_t tableLength = 0;
        // Each field is read only if what is left of the chunk holds it.
        if (left >= 8) {
            riffSize = ReadValue<uint64_t>(file, wrongEndian);
            left -= 8;
        }
        if (left >= 8) {
            m_DataSize = ReadValue<uint64_t>(file, wrongEndian);
            left -= 8;
        }
        if (left >= 8) {
            m_SampleCount = ReadValue<uint64_t>(file, wrongEndian);
            left -= 8;
        }
        if (left >= 4) {
            tableLength = ReadValue<uint32_t>(file, wrongEndian);
            left -= 4;
        }
        const bool accepted = m_DataSize != 0 || m_SampleCount != 0;
        if (accepted && left > 0) fseeko(file, left, SEEK_CUR);
        // The values stand one label to the left of their meaning and the last
        // placeholder gets a 0 of its own: the message is kept as it has always
        // read, since people compare logs by it.
        g_logger.Write(accepted ? kTOVDebugLevelTrace : kTOVDebugLevelError,
                       "Parsed RF64(%llu) RIFF-SIZE=[%llu] DATA-SIZE=[%llu] SAMPLES=[%llu] ENTRIES=[%lu]",
                       static_cast<unsigned long long>(riffSize), static_cast<unsigned long long>(m_DataSize),
                       static_cast<unsigned long long>(m_SampleCount), static_cast<unsigned long long>(tableLength),
                       0UL);
        return accepted;
    } catch (...) {
        g_logger.Write(kTOVDebugLevelException, "Exception Caught in DS64Chunk::InitChunkFromStream()");
        return false;
    }
}

}  // namespace DS64
}  // namespace Chunks
