#pragma once
/// The chunks that have a parser: one row each, read by the stream (which
/// parsers it makes, which identifier goes to which), by its masks and by
/// whatever lists the chunks. A new chunk is its parser class and one row.
#include <memory>
#include <type_traits>

#include "reader/BEXTChunk.h"
#include "reader/COMMChunk.h"
#include "reader/Chunk.h"
#include "reader/DATAChunk.h"
#include "reader/DS64Chunk.h"
#include "reader/FMTChunk.h"
#include "reader/SSNDChunk.h"
#include "reader/UMIDChunk.h"
#include "reader/ixml/IXMLChunk.h"

namespace Orlo {

class OrloStream;

struct ChunkTableRow {
    /// The four identifier characters as they stand in a file.
    const char* id;
    /// The parser class's kMaskBit.
    unsigned int bit;
    /// A new parser for a stream that owns it.
    std::shared_ptr<Chunks::Chunk> (*makeParser)(OrloStream& stream);
};

/// A parser that reads earlier chunks' answers is handed its stream.
template <typename Parser>
std::shared_ptr<Chunks::Chunk> MakeParser(OrloStream& stream) {
    if constexpr (std::is_constructible_v<Parser, OrloStream*>) {
        return std::make_shared<Parser>(&stream);
    } else {
        (void)stream;
        return std::make_shared<Parser>();
    }
}

template <typename Parser>
constexpr ChunkTableRow Row(const char* id) {
    return {id, Parser::kMaskBit, &MakeParser<Parser>};
}

/// In the order of the stream's interface, which is the order of their bits
/// and the order in which the chunks are listed, never the file's.
inline constexpr ChunkTableRow kChunkTable[] = {
    Row<Chunks::DS64::DS64Chunk>("ds64"),  // RF64's 64-bit sizes
    Row<Chunks::FMT::FMTChunk>("fmt "),    // WAVE sample format
    Row<Chunks::DATA::DATAChunk>("data"),  // WAVE samples
    Row<Chunks::BEXT::BEXTChunk>("bext"),  // Broadcast Wave description
    Row<Chunks::IXML::IXMLChunk>("iXML"),  // production metadata
    Row<Chunks::UMID::UMIDChunk>("umid"),  // a recorder's identity
    Row<Chunks::COMM::COMMChunk>("COMM"),  // AIFF sample format
    Row<Chunks::SSND::SSNDChunk>("SSND"),  // AIFF samples
};

// A row's bit is its own and above the bits of the rows before it, so that
// masks and the listing order agree.
constexpr bool BitsAscendOneEach() {
    unsigned int before = 0;
    for (const ChunkTableRow& row : kChunkTable) {
        if (row.bit <= before || (row.bit & (row.bit - 1)) != 0) return false;
        before = row.bit;
    }
    return true;
}
static_assert(BitsAscendOneEach(), "each chunk needs a bit of its own, above those of the rows before it");

constexpr unsigned int AllChunkBits() {
    unsigned int all = 0;
    for (const ChunkTableRow& row : kChunkTable) all |= row.bit;
    return all;
}

/// The mask of every chunk in the table.
inline constexpr unsigned int kAllChunks = AllChunkBits();

}  // namespace Orlo
