#include "reader/BEXTChunk.h"

#include <algorithm>
#include <exception>
#include <iterator>
#include <string_view>

#include "reader/ReadValue.h"

namespace Chunks {
namespace BEXT {

namespace {
constexpr uint32_t kFixedSize = 602;
// Where the UMID starts: a version above 2 is read no further than this.
constexpr uint32_t kVersionEnd = 348;
constexpr size_t kDescriptionSize = 256;

void ReadText(std::string& out, size_t count, FILE* file) {
    HelperFunctions::ReadBytes(out, count, file, HelperFunctions::kShortReadMessage);
}
}  // namespace

bool BEXTChunk::InitChunkFromStream(const ChunkHeader_t& header, FILE* file, bool wrongEndian) {
    using HelperFunctions::ReadValue;
    try {
        m_Header = header;
        if (header.chunkSize < kFixedSize) return false;
        ReadText(m_Description, kDescriptionSize, file);
        ParseBEXTDescriptionField();
        ReadText(m_Originator, 32, file);
        ReadText(m_OriginatorReference, 32, file);
        ReadText(m_OriginationDate, 10, file);
        ReadText(m_OriginationTime, 8, file);
        m_TimeReference = ReadValue<uint64_t>(file, wrongEndian);
        m_Version = ReadValue<uint16_t>(file, wrongEndian);

        uint32_t historyStart = kFixedSize;
        if (m_Version == 1 || m_Version == 2) {
            HelperFunctions::ReadBytes(reinterpret_cast<char*>(m_UMID), sizeof m_UMID, file,
                                       HelperFunctions::kShortReadMessage);
        }
        if (m_Version == 2) {
            m_Loudness.loudnessValue = ReadValue<int16_t>(file, wrongEndian);
            m_Loudness.loudnessRange = ReadValue<int16_t>(file, wrongEndian);
            m_Loudness.maxTruePeakLevel = ReadValue<int16_t>(file, wrongEndian);
            m_Loudness.maxMomentaryLoudness = ReadValue<int16_t>(file, wrongEndian);
            m_Loudness.maxShortTermLoudness = ReadValue<int16_t>(file, wrongEndian);
        }
        switch (m_Version) {
            case 0:
                fseeko(file, 254, SEEK_CUR);
                break;
            case 1:
                fseeko(file, 190, SEEK_CUR);
                break;
            case 2:
                fseeko(file, 180, SEEK_CUR);
                break;
            default:
                // A version from the future: its layout is unknown, so all of
                // it is kept as coding history.
                historyStart = kVersionEnd;
                break;
        }
        const uint32_t left = header.chunkSize - historyStart;
        if (left > 0) ReadText(m_CodingHistory, left, file);
        return true;
    } catch (const std::exception&) {
        return false;
    }
}

void BEXTChunk::ParseBEXTDescriptionField() {
    if (std::all_of(m_Description.begin(), m_Description.end(), [](char c) { return c == '\0'; })) return;
    try {
        // Recorders write one keyword a line, each behind a one-character type
        // mark ("sSCENE=12A"), closed by CR LF or a zero byte. The zero bytes
        // that pad the field are many empty lines, so lines are only looked at
        // in place.
        const std::string_view text(m_Description);
        const auto endsLine = [](char c) { return c == '\r' || c == '\n' || c == '\0'; };
        size_t start = 0;
        while (start <= text.size()) {
            const size_t end = std::find_if(text.begin() + start, text.end(), endsLine) - text.begin();
            const std::string_view piece = text.substr(start, end - start);
            start = end + 1;
            const size_t equals = piece.find('=');
            if (piece.size() < 2 || equals == std::string_view::npos) continue;
            const std::string key(equals == 0 ? std::string_view() : piece.substr(1, equals - 1));
            std::string value;
            const std::string_view rest = piece.substr(equals + 1);
            std::remove_copy(rest.begin(), rest.end(), std::back_inserter(value), '"');
            m_ParsedDescription[key] = std::move(value);
        }
    } catch (...) {
        // Whatever goes wrong here, the chunk keeps the keywords taken so far.
    }
}

}  // namespace BEXT
}  // namespace Chunks
