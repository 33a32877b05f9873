#include "ChunkPayloads.h"

#include <algorithm>

#include "Bytes.h"

namespace Payload {

using namespace Bytes;

std::string FmtChunk(const Fmt& fmt) {
    const uint16_t frameBytes = static_cast<uint16_t>(fmt.channels * ((fmt.bits + 7) / 8));
    std::string out = LE16(fmt.code) + LE16(fmt.channels) + LE32(fmt.rate) + LE32(fmt.rate * frameBytes) +
                      LE16(frameBytes) + LE16(fmt.bits);
    if (fmt.code != 0xFFFE) return out;
    std::string extension = LE16(fmt.bits) + LE32(0) + LE16(fmt.subFormat) +
                            std::string("\x00\x00\x00\x00\x10\x00\x80\x00\x00\xAA\x00\x38\x9B\x71", 14);
    extension.resize(std::min<size_t>(fmt.extensionSize, extension.size()));
    return out + LE16(fmt.extensionSize) + extension;
}

std::string Ds64Chunk(uint64_t riffSize, uint64_t dataSize, uint64_t sampleCount, uint32_t tableLength) {
    std::string out = LE64(riffSize) + LE64(dataSize) + LE64(sampleCount) + LE32(tableLength);
    for (uint32_t i = 0; i < tableLength; ++i) out += "junk" + LE64(0);
    return out;
}

std::string CommChunk(const Comm& comm) {
    std::string out = BE16(comm.channels) + BE32(comm.frames) + BE16(comm.bits) + Extended80(comm.rate);
    if (comm.compression.empty()) return out;
    // The name is a Pascal string, padded to an even length.
    std::string name = static_cast<char>(comm.compressionName.size()) + comm.compressionName;
    if (name.size() % 2) name += '\0';
    return out + Fixed(comm.compression, 4) + name;
}

std::string SsndChunk(uint32_t offset, const std::string& samples) {
    return BE32(offset) + BE32(0) + std::string(offset, '\0') + samples;
}

std::string BextChunk(const Bext& bext) {
    std::string out = Fixed(bext.description, 256) + Fixed(bext.originator, 32) + Fixed(bext.originatorReference, 32) +
                      Fixed(bext.originationDate, 10) + Fixed(bext.originationTime, 8) + LE64(bext.timeReference) +
                      LE16(bext.version);
    if (bext.version == 1 || bext.version == 2) out += Fixed(bext.umid, 64);
    if (bext.version == 2)
        for (int16_t value : bext.loudness) out += LE16(static_cast<uint16_t>(value));
    out.resize(602, '\0');
    return out + bext.codingHistory;
}

}  // namespace Payload
