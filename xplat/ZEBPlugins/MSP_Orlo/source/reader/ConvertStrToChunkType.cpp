#include "reader/ConvertStrToChunkType.h"

#include "reader/ChunkIds.h"
#include "reader/OrloStream.h"

namespace Orlo {

unsigned int ConvertStrToChunkType(const std::string& id) {
    static const struct {
        const char* id;
        OrloStream::SupportedChunks type;
    } kTable[] = {
        {Chunks::COMM::COMMChunkId, OrloStream::COMM_CHUNK}, {Chunks::SSND::SSNDChunkId, OrloStream::SSND_CHUNK},
        {Chunks::FMT::FMTChunkId, OrloStream::FMT_CHUNK},    {Chunks::DATA::DATAChunkId, OrloStream::DATA_CHUNK},
        {Chunks::DS64::ChunkId, OrloStream::DS64_CHUNK},     {Chunks::BEXT::BEXTChunkId, OrloStream::BEXT_CHUNK},
        {Chunks::IXML::IXMLChunkId, OrloStream::IXML_CHUNK}, {Chunks::UMID::UMIDChunkId, OrloStream::UMID_CHUNK},
    };
    for (const auto& row : kTable)
        if (id == row.id) return row.type;
    return 0;
}

}  // namespace Orlo
