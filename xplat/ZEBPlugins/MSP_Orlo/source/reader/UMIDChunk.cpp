#include "reader/UMIDChunk.h"

#include <algorithm>
#include <exception>

#include "reader/ReadValue.h"

namespace Chunks {
namespace UMID {

bool UMIDChunk::InitChunkFromStream(const ChunkHeader_t& header, FILE* file, bool) {
    try {
        m_Header = header;
        if (header.chunkSize < sizeof m_UMID) return false;
        HelperFunctions::ReadBytes(reinterpret_cast<char*>(m_UMID), sizeof m_UMID, file,
                                   HelperFunctions::kShortReadMessage);
        CheckValidity();
        // Deliberately not skipping the rest of a longer chunk: files in the
        // field have been read this way, and their clips keep what they were.
        return true;
    } catch (const std::exception&) {
        return false;
    }
}

void UMIDChunk::CheckValidity() {
    m_Valid = std::any_of(std::begin(m_UMID), std::end(m_UMID), [](unsigned char b) { return b != 0; });
}

}  // namespace UMID
}  // namespace Chunks
