#pragma once
/// A `umid` chunk: 24 bytes of identity that a recorder writes beside `bext`.
#include "reader/Chunk.h"

namespace Chunks {
namespace UMID {

class UMIDChunk : public Chunk {
public:
    /// This parser's bit in the stream's chunk masks.
    static constexpr unsigned int kMaskBit = 1u << 5;

    /// Refuses a chunk under 24 bytes. Reads exactly 24 bytes, whatever the
    /// chunk's size: the walk goes on from there.
    bool InitChunkFromStream(const ChunkHeader_t& header, FILE* file, bool wrongEndian) override;

    /// The 24 bytes; bytes 3 to 18 are the material identifier.
    const unsigned char* GetUMID() const { return m_UMID; }
    bool IsValid() const { return m_Valid; }
    /// Valid = any byte is not zero.
    void CheckValidity();

private:
    unsigned char m_UMID[24] = {};
    bool m_Valid = false;
};

}  // namespace UMID
}  // namespace Chunks
