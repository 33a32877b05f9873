#include "reader/SSNDChunk.h"

#include <exception>

#include "reader/ReadValue.h"

namespace Chunks {
namespace SSND {

bool SSNDChunk::InitChunkFromStream(const ChunkHeader_t& header, FILE* file, bool wrongEndian) {
    using HelperFunctions::ReadValue;
    try {
        m_Header = header;
        if (header.chunkSize < 8) return false;
        const uint32_t offset = ReadValue<uint32_t>(file, wrongEndian);
        // The block size is read and never used.
        ReadValue<uint32_t>(file, false);
        m_MediaStartPos = ftello(file) + offset;
        if (header.chunkSize > 8) fseeko(file, header.chunkSize - 8, SEEK_CUR);
        return true;
    } catch (const std::exception&) {
        return false;
    }
}

}  // namespace SSND
}  // namespace Chunks
