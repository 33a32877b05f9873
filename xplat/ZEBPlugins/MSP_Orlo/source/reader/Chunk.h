#pragma once
/// Base of every chunk parser. The stream owns one parser object per supported
/// chunk type and hands each occurrence of that chunk to it.
#include <cstdio>

#include "reader/ChunkHeader_t.h"

namespace Chunks {

class Chunk {
public:
    virtual ~Chunk() = default;

    /// On entry `file` stands at the first payload byte and `header` holds the
    /// padded size. True accepts the chunk and leaves the file at the first
    /// byte after the payload; false means "as if it were not there", and the
    /// stream repositions the file. `wrongEndian`: the file's integers are not
    /// in host byte order.
    virtual bool InitChunkFromStream(const ChunkHeader_t& header, FILE* file, bool wrongEndian) = 0;

    /// The header this parser was last given.
    const ChunkHeader_t& GetHeader() const { return m_Header; }

protected:
    ChunkHeader_t m_Header;
};

}  // namespace Chunks
