#include "reader/ixml/IXMLChunk.h"

#include "reader/ReadBytes.h"
#include "reader/ReadValue.h"
#include "reader/ixml/IXMLTextParsers.h"

namespace Chunks {
namespace IXML {

bool IXMLChunk::InitChunkFromStream(const ChunkHeader_t& header, FILE* file, bool) {
    m_Header = header;
    if (header.chunkSize == 0) return false;
    HelperFunctions::ReadBytes(m_RawXml, header.chunkSize, file, HelperFunctions::kShortReadMessage);
    TruncateIXMLString(m_RawXml);
    static constexpr char kMisspelled[] = "encording";
    const size_t misspelled = m_RawXml.find(kMisspelled);
    if (misspelled != std::string::npos) m_RawXml.replace(misspelled, sizeof kMisspelled - 1, "encoding");
    return true;
}

}  // namespace IXML
}  // namespace Chunks
