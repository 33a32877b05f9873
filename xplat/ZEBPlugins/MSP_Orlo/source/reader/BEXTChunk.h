#pragma once
/// The Broadcast Wave `bext` chunk (EBU Tech 3285, versions 0 to 2), with the
/// production keywords that recorders write into its Description.
#include <cstdint>
#include <map>
#include <string>

#include "reader/Chunk.h"

namespace Chunks {
namespace BEXT {

/// The version 2 loudness fields, as stored (hundredths of a unit).
struct BEXTLoudness {
    int16_t loudnessValue = 0;
    int16_t loudnessRange = 0;
    int16_t maxTruePeakLevel = 0;
    int16_t maxMomentaryLoudness = 0;
    int16_t maxShortTermLoudness = 0;
};

class BEXTChunk : public Chunk {
public:
    /// This parser's bit in the stream's chunk masks.
    static constexpr unsigned int kMaskBit = 1u << 3;

    /// Refuses a chunk under 602 bytes, the fixed part.
    bool InitChunkFromStream(const ChunkHeader_t& header, FILE* file, bool wrongEndian) override;

    /// The fixed-size text fields, all their bytes, zero bytes included.
    std::string GetDescription() const { return m_Description; }
    std::string GetOriginator() const { return m_Originator; }
    std::string GetOriginatorReference() const { return m_OriginatorReference; }
    std::string GetOriginationDate() const { return m_OriginationDate; }
    std::string GetOriginationTime() const { return m_OriginationTime; }
    /// Samples since midnight.
    uint64_t GetTimeReference() const { return m_TimeReference; }
    uint16_t GetVersion() const { return m_Version; }
    /// The 64 UMID bytes; zero when the version has none.
    const unsigned char* GetUMID() const { return m_UMID; }
    const BEXTLoudness& GetLoudness() const { return m_Loudness; }
    /// Everything behind the fixed part, pad byte included.
    std::string GetCodingHistory() const { return m_CodingHistory; }
    /// The Description keywords. A copy: the clip model's look-ups may change it.
    std::map<std::string, std::string> GetParsedDescriptionField() const { return m_ParsedDescription; }
    const std::map<std::string, std::string>& GetConstParsedDescriptionField() const { return m_ParsedDescription; }

private:
    void ParseBEXTDescriptionField();

    std::string m_Description;
    std::string m_Originator;
    std::string m_OriginatorReference;
    std::string m_OriginationDate;
    std::string m_OriginationTime;
    uint64_t m_TimeReference = 0;
    uint16_t m_Version = 0;
    unsigned char m_UMID[64] = {};
    BEXTLoudness m_Loudness;
    std::string m_CodingHistory;
    std::map<std::string, std::string> m_ParsedDescription;
};

}  // namespace BEXT
}  // namespace Chunks
