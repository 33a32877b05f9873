#include "reader/ConvertStrToChunkType.h"

#include "reader/ChunkTable.h"

namespace Orlo {

unsigned int ConvertStrToChunkType(const std::string& id) {
    for (const ChunkTableRow& row : kChunkTable)
        if (id == row.id) return row.bit;
    return 0;
}

}  // namespace Orlo
