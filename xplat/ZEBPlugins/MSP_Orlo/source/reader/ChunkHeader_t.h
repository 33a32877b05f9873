#pragma once
/// The header of one chunk as the reader carries it.
#include <cstdint>
#include <string>

namespace Chunks {

struct ChunkHeader_t {
    /// The four identifier bytes as zero-terminated text: an identifier with a
    /// zero byte in it is cut there, and so is unknown.
    std::string chunkId;
    /// Payload size in host byte order; the stream rounds it up to even before
    /// a parser sees it.
    uint32_t chunkSize = 0;

    void clear() {
        chunkId.clear();
        chunkSize = 0;
    }
};

}  // namespace Chunks
