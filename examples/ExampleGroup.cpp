#include "ExampleGroup.h"

#include <cstdint>

#include "AudioFileWriter.h"
#include "ChunkPayloads.h"
#include "ExampleIxml.h"
#include "ExampleTone.h"

namespace ExampleGroup {

namespace {

// 10:23:41:00 as samples since midnight.
constexpr uint64_t kStart = (10ull * 3600 + 23 * 60 + 41) * ExampleTone::kRate;
// Tones that divide the second into whole periods: 1 kHz, 500 Hz, 750 Hz.
constexpr uint32_t kHertz[kChannels] = {1000, 500, 750};

// A basic SMPTE UMID whose material ends in the channel, and no signature.
std::string Umid(int channel) {
    const unsigned char basic[32] = {0x06, 0x0A, 0x2B, 0x34, 0x01, 0x01, 0x01, 0x05, 0x01, 0x01, 0x0D,
                                     0x20, 0x13, 0x00, 0x00, 0x00, 0x61, 0x9C, 0x3E, 0x20, 0x4A, 0x03,
                                     0x11, 0xEF, 0x80, 0x00, 0x14, 0xB0, 0x02, 0x00, 0x00, 0x00};
    std::string umid(reinterpret_cast<const char*>(basic), sizeof basic);
    umid[31] = static_cast<char>(channel);
    return umid + std::string(32, '\0');
}

}  // namespace

std::string FileName(int channel) { return "14B-T02_" + std::to_string(channel) + ".wav"; }

std::string TrackName(int channel) { return channel == 1 ? "Boom" : "Lav " + std::to_string(channel - 1); }

std::string BextPayload(int channel) {
    Payload::Bext bext;
    bext.description = "sSPEED=025.00-NDF\r\nsTAKE=2\r\nsSCENE=14B\r\nsFILENAME=" + FileName(channel) +
                       "\r\nsTAPE=DAY02\r\nsTRK" + std::to_string(channel) + "=" + TrackName(channel) + "\r\n";
    bext.originator = "Orlo example";
    bext.originatorReference = "ORLO14B000" + std::to_string(channel);
    bext.originationDate = "2024-05-18";
    bext.originationTime = "10:23:41";
    bext.timeReference = kStart;
    bext.version = 1;
    bext.umid = Umid(channel);
    bext.codingHistory = "A=PCM,F=48000,W=24,M=mono,T=Orlo example\r\n";
    return Payload::BextChunk(bext);
}

std::string IxmlPayload(int channel) {
    return "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
           "<BWFXML>\n"
           "  <IXML_VERSION>2.10</IXML_VERSION>\n"
           "  <PROJECT>Harbour Lights</PROJECT>\n"
           "  <SCENE>14B</SCENE>\n"
           "  <TAKE>2</TAKE>\n"
           "  <TAPE>DAY02</TAPE>\n"
           "  <FILE_UID>ORL14B0002D20240518T10234100000" +
           std::to_string(channel) + "</FILE_UID>\n" + ExampleIxml::Speed(kStart) +
           "  <TRACK_LIST>\n"
           "    <TRACK_COUNT>1</TRACK_COUNT>\n" +
           ExampleIxml::Track(channel, 1, TrackName(channel)) +
           "  </TRACK_LIST>\n"
           "</BWFXML>\n";
}

std::string File(int channel) {
    Payload::Fmt fmt;
    fmt.channels = 1;
    fmt.rate = ExampleTone::kRate;
    fmt.bits = 24;
    return AudioFileWriter::Wave()
        .Chunk("bext", BextPayload(channel))
        .Chunk("fmt ", Payload::FmtChunk(fmt))
        .Chunk("data", ExampleTone::Samples(kHertz[channel - 1], 1))
        .Chunk("iXML", IxmlPayload(channel))
        .Bytes();
}

}  // namespace ExampleGroup
