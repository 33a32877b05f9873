#include "reader/FMTChunk.h"

#include <exception>

#include "reader/ReadValue.h"

namespace Chunks {
namespace FMT {

namespace {
constexpr uint16_t kPCM = 1;
constexpr uint16_t kFloat = 3;
constexpr uint16_t kExtensible = 0xFFFE;
}  // namespace

bool FMTChunk::InitChunkFromStream(const ChunkHeader_t& header, FILE* file, bool wrongEndian) {
    using HelperFunctions::ReadValue;
    try {
        m_Header = header;
        m_CompressionCode = ReadValue<uint16_t>(file, wrongEndian);
        m_SubFormatCode = 0;
        bool acceptable = m_CompressionCode == kPCM || m_CompressionCode == kFloat || m_CompressionCode == kExtensible;
        m_ChannelCount = ReadValue<uint16_t>(file, wrongEndian);
        m_SampleRate = ReadValue<uint32_t>(file, wrongEndian);
        m_AverageBPS = ReadValue<uint32_t>(file, wrongEndian);
        m_BlockAlign = ReadValue<uint16_t>(file, wrongEndian);
        m_BitsPerSample = ReadValue<uint16_t>(file, wrongEndian);

        // Computed in 32 bits: a chunk smaller than its fixed part gives a huge
        // forward seek that ends the walk.
        uint32_t remaining = header.chunkSize - 16;
        if (m_CompressionCode == kExtensible) {
            const uint16_t extensionSize = ReadValue<uint16_t>(file, wrongEndian);
            remaining = header.chunkSize - 18;
            if (extensionSize == 0) {
                acceptable = false;
            } else if (extensionSize >= 8) {
                // Valid bits and channel mask are not needed.
                fseeko(file, 6, SEEK_CUR);
                m_SubFormatCode = ReadValue<uint16_t>(file, wrongEndian);
                remaining = header.chunkSize - 26;
                acceptable = m_SubFormatCode == kPCM || m_SubFormatCode == kFloat;
            }
            // An extension of 1 to 7 bytes names no sub-format: the chunk stays,
            // reading as neither integer nor floating point.
        }
        if (!acceptable) return false;
        fseeko(file, remaining, SEEK_CUR);
        return true;
    } catch (const std::exception&) {
        return false;
    }
}

bool FMTChunk::IsPCM() const {
    return m_CompressionCode == kPCM || (m_CompressionCode == kExtensible && m_SubFormatCode == kPCM);
}

bool FMTChunk::IsFloatingPoint() const {
    return m_CompressionCode == kFloat || (m_CompressionCode == kExtensible && m_SubFormatCode == kFloat);
}

}  // namespace FMT
}  // namespace Chunks
