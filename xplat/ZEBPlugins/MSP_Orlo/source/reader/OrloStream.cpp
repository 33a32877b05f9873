#include "reader/OrloStream.h"

#include <cstring>
#include <stdexcept>
#include <vector>

#include "reader/CalcBytesRemaining.h"
#include "reader/ConvertStrToChunkType.h"
#include "reader/OpenForWalk.h"
#include "reader/PerformAdditionalInitialization.h"
#include "reader/ReadBytes.h"
#include "reader/ReadValue.h"
#include "reader/StreamErrors.h"

namespace Orlo {

namespace {
const char* const kNoValue = "value does not exist";
const std::string kHeaderMessage = "Expected chunk header";
}  // namespace

OrloStream::OrloStream(const char* path, unsigned int chunks) {
    // One parser per type, made before the file opens.
    for (const ChunkTableRow& row : kChunkTable) m_Parsers[row.bit] = row.makeParser(*this);

    try {
        m_FullFileName = path ? path : "";
        m_File = path ? HelperFunctions::OpenForWalk(path) : nullptr;
        if (!m_File) throw "File could not be opened";
        m_FileSize = Chunks::CalcBytesRemaining(path, m_File);
        ReadAndParseFile(chunks);
        const uint16_t bits = GetBitsPerSample();
        if (bits != 16 && bits != 24 && bits != 32) throw kUnsupportedBitsError;
        if (GetIsDataFloatingPoint() && bits != 32)
            throw "Only 32-bit is supported when sample format is floating point";
        // No later stage can lay out frames of no channels.
        if (GetChannelCount() == 0) throw kNoChannelsError;
    } catch (const char* text) {
        m_Error = text;
    } catch (...) {
        m_Error = "Unknown C++ exception";
    }
    if (m_File) std::fclose(m_File);
    m_File = nullptr;
}

void OrloStream::ReadFourBytes(char* out, const std::string& message) {
    HelperFunctions::ReadBytes(out, 4, m_File, message);
}

void OrloStream::ReadAndParseFile(unsigned int chunks) {
    if (chunks == 0) throw "No chunks specified for reading!";
    char id[4];
    ReadFourBytes(id, HelperFunctions::kShortReadMessage);
    const bool little = HelperFunctions::IAmLittleEndian();
    if (std::memcmp(id, "FORM", 4) == 0) {
        m_FileWrongEndian = little;
    } else if (std::memcmp(id, "RIFF", 4) == 0 || std::memcmp(id, "RF64", 4) == 0) {
        m_FileWrongEndian = !little;
        m_RF64 = std::memcmp(id, "RF64", 4) == 0;
    } else {
        throw "Input does not appear to be either AIFF or WAVE";
    }

    // The outer header's size is never used. In a file of under 8 bytes nothing
    // is consumed here, and the form type is read from offset 0 again.
    fseeko(m_File, 0, SEEK_SET);
    Chunks::ChunkHeader_t outer;
    ReadChunkHeader(&outer);
    ReadFourBytes(id, HelperFunctions::kShortReadMessage);
    if (std::memcmp(id, "AIFC", 4) != 0 && std::memcmp(id, "AIFF", 4) != 0 && std::memcmp(id, "WAVE", 4) != 0)
        throw "Input is not a WAVE, AIFF, or AIFF-C file";

    Chunks::ChunkHeader_t header;
    for (;;) {
        header.clear();
        if (!ReadChunkHeader(&header)) break;
        ReadAndInitChunk(header);
    }
}

// A file whose data size was never written (a recorder that lost power) has
// its samples walked as chunks, and digital silence there is a run of empty,
// nameless chunks of 8 bytes each. Walked one by one, a muted gigabyte takes
// many seconds; this passes over the run at read speed and stops where the
// walk would find something else, so the outcome is the same.
void OrloStream::SkipEmptyChunks() {
    static const char kEmpty[8] = {};
    off_t position = ftello(m_File);
    if (position < 0) return;
    std::vector<char> block(1 << 16);
    for (;;) {
        const size_t got = std::fread(block.data(), 1, block.size(), m_File);
        size_t empty = 0;
        while (empty + 8 <= got && std::memcmp(block.data() + empty, kEmpty, 8) == 0) empty += 8;
        position += static_cast<off_t>(empty);
        if (empty < block.size()) break;
    }
    fseeko(m_File, position, SEEK_SET);
}

bool OrloStream::ReadChunkHeader(Chunks::ChunkHeader_t* header) {
    const off_t position = ftello(m_File);
    if (position < 0) return false;
    // A trailing run of up to 7 bytes is no chunk: writers leave such tails.
    if (position >= m_FileSize || m_FileSize - position < 8) return false;
    char id[5] = {};
    ReadFourBytes(id, kHeaderMessage);
    char size[4];
    ReadFourBytes(size, kHeaderMessage);
    header->chunkId = id;
    std::memcpy(&header->chunkSize, size, 4);
    if (m_FileWrongEndian) HelperFunctions::SwapULong(header->chunkSize);
    return true;
}

void OrloStream::ReadAndInitChunk(Chunks::ChunkHeader_t header) {
    const off_t payload = ftello(m_File);
    // Parsers see the padded size; 0xFFFFFFFF wraps to 0.
    if (header.chunkSize & 1) header.chunkSize += 1;
    const unsigned int type = ConvertStrToChunkType(header.chunkId);
    const auto parser = m_Parsers.find(type);
    if (parser == m_Parsers.end()) {
        if (header.chunkSize != 0) {
            fseeko(m_File, header.chunkSize, SEEK_CUR);
        } else if (header.chunkId.empty()) {
            SkipEmptyChunks();
        }
        return;
    }
    if (type == DATA_CHUNK && !HasChunk(FMT_CHUNK)) throw "Malformed WAVE file with 'DATA' before 'fmt '";
    if (type == SSND_CHUNK && !HasChunk(COMM_CHUNK)) throw "Malformed AIFF file with 'SSND' before 'COMM'";
    if (!parser->second->InitChunkFromStream(header, m_File, m_FileWrongEndian)) {
        fseeko(m_File, payload + static_cast<off_t>(header.chunkSize), SEEK_SET);
        return;
    }
    m_ChunksSeen |= type;
    PerformAdditionalInitialization(*this, type);
}

template <typename First, typename Second, typename Value, typename Get>
Value OrloStream::FromFirstAccepted(Get get) const {
    if (HasChunk(First::kMaskBit)) return get(*GetChunk<First>());
    if (HasChunk(Second::kMaskBit)) return get(*GetChunk<Second>());
    throw std::logic_error(kNoValue);
}

using Chunks::COMM::COMMChunk;
using Chunks::DATA::DATAChunk;
using Chunks::FMT::FMTChunk;
using Chunks::SSND::SSNDChunk;

uint16_t OrloStream::GetChannelCount() const {
    return FromFirstAccepted<FMTChunk, COMMChunk, uint16_t>([](const auto& c) { return c.GetChannelCount(); });
}

uint16_t OrloStream::GetBitsPerSample() const {
    return FromFirstAccepted<FMTChunk, COMMChunk, uint16_t>([](const auto& c) { return c.GetBitsPerSample(); });
}

bool OrloStream::GetIsDataFloatingPoint() const {
    return FromFirstAccepted<FMTChunk, COMMChunk, bool>([](const auto& c) { return c.IsFloatingPoint(); });
}

double OrloStream::GetSampleRate() const {
    return FromFirstAccepted<FMTChunk, COMMChunk, double>([](const auto& c) { return c.GetSampleRate(); });
}

uint64_t OrloStream::GetSampleCount() const {
    return FromFirstAccepted<DATAChunk, COMMChunk, uint64_t>([](const auto& c) { return c.GetSampleCount(); });
}

bool OrloStream::GetIsDataWrongEndian() const {
    return FromFirstAccepted<DATAChunk, COMMChunk, bool>([](const auto& c) { return c.IsDataWrongEndian(); });
}

uint16_t OrloStream::GetSampleSize() const {
    return FromFirstAccepted<DATAChunk, SSNDChunk, uint16_t>([](const auto& c) { return c.GetSampleSize(); });
}

int64_t OrloStream::GetStartPosition() const {
    return FromFirstAccepted<DATAChunk, SSNDChunk, int64_t>([](const auto& c) { return c.GetMediaStartPos(); });
}

int64_t OrloStream::GetSamplePosition(unsigned long long sample) const {
    return GetStartPosition() + static_cast<int64_t>(GetSampleSize() * sample * GetChannelCount());
}

int64_t OrloStream::GetBytesRemaining() const {
    if (m_FileSize < 1) throw "Missing file-size attribute from file system.";
    if (!m_File) return -1;
    return m_FileSize - ftello(m_File);
}

}  // namespace Orlo
