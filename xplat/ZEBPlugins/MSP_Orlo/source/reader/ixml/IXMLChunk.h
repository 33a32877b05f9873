#pragma once
/// The `iXML` chunk: production metadata as XML text, with two faults of
/// known writers mended before anyone parses it.
#include <string>

#include "reader/Chunk.h"

namespace Chunks {
namespace IXML {

class IXMLChunk : public Chunk {
public:
    /// This parser's bit in the stream's chunk masks.
    static constexpr unsigned int kMaskBit = 1u << 4;

    /// Refuses an empty chunk. Reads the whole padded payload, cuts it after
    /// its last ">" (recorders pad behind the root element) and corrects the
    /// first "encording" to "encoding" (a writer misspells its declaration).
    bool InitChunkFromStream(const ChunkHeader_t& header, FILE* file, bool wrongEndian) override;

    /// The mended text, as long as the chunk lives: a document may be tens of
    /// megabytes, so a caller that keeps it copies it.
    const std::string& GetRawXml() const { return m_RawXml; }

private:
    std::string m_RawXml;
};

}  // namespace IXML
}  // namespace Chunks
