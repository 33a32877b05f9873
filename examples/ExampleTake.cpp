#include "ExampleTake.h"

#include <cstdint>

#include "AudioFileWriter.h"
#include "Bytes.h"
#include "ChunkPayloads.h"
#include "ExampleIxml.h"
#include "ExampleTone.h"

namespace ExampleTake {

namespace {

using ExampleTone::kRate;
// 01:00:00:00 as samples since midnight.
constexpr uint64_t kStart = 3600ull * kRate;

// A basic SMPTE UMID (label, length, instance, material) and no signature.
std::string Umid() {
    const unsigned char basic[32] = {0x06, 0x0A, 0x2B, 0x34, 0x01, 0x01, 0x01, 0x05, 0x01, 0x01, 0x0D,
                                     0x20, 0x13, 0x00, 0x00, 0x00, 0x5E, 0x2B, 0x7C, 0x11, 0x4A, 0x03,
                                     0x11, 0xEF, 0x80, 0x00, 0x12, 0x34, 0x56, 0x78, 0x9A, 0xBC};
    return std::string(reinterpret_cast<const char*>(basic), sizeof basic) + std::string(32, '\0');
}

}  // namespace

std::string BextPayload() {
    Payload::Bext bext;
    bext.description =
        "sSPEED=025.00-NDF\r\nsTAKE=3\r\nsUBITS=12311804\r\nsSWVER=1.0\r\nsPROJECT=Harbour Lights\r\n"
        "sSCENE=12A\r\nsFILENAME=12A-T03.wav\r\nsTAPE=DAY01\r\nsTRK1=Boom\r\nsTRK2=Lav\r\nsNOTE=wind from the "
        "east\r\nsCIRCLED=TRUE\r\n";
    bext.originator = "Orlo example";
    bext.originatorReference = "ORLO12A0003";
    bext.originationDate = "2024-05-17";
    bext.originationTime = "13:45:10";
    bext.timeReference = kStart;
    bext.version = 1;
    bext.umid = Umid();
    bext.codingHistory = "A=PCM,F=48000,W=24,M=stereo,T=Orlo example\r\n";
    return Payload::BextChunk(bext);
}

std::string IxmlPayload(size_t padTo) {
    const std::string start = std::to_string(kStart);
    std::string text =
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
        "<BWFXML>\n"
        "  <IXML_VERSION>2.10</IXML_VERSION>\n"
        "  <PROJECT>Harbour Lights</PROJECT>\n"
        "  <SCENE>12A</SCENE>\n"
        "  <TAKE>3</TAKE>\n"
        "  <TAPE>DAY01</TAPE>\n"
        "  <CIRCLED>TRUE</CIRCLED>\n"
        "  <FILE_UID>ORL12A0003D20240517T134510A1B2C3</FILE_UID>\n"
        "  <UBITS>12311804</UBITS>\n"
        "  <NOTE>wind from the east</NOTE>\n" +
        ExampleIxml::Speed(kStart) +
        "  <TRACK_LIST>\n"
        "    <TRACK_COUNT>2</TRACK_COUNT>\n" +
        ExampleIxml::Track(1, 1, "Boom") + ExampleIxml::Track(2, 2, "Lav") +
        "  </TRACK_LIST>\n"
        "  <BEXT>\n"
        "    <BWF_ORIGINATOR>Orlo example</BWF_ORIGINATOR>\n"
        "    <BWF_ORIGINATION_DATE>2024-05-17</BWF_ORIGINATION_DATE>\n"
        "    <BWF_ORIGINATION_TIME>13:45:10</BWF_ORIGINATION_TIME>\n"
        "    <BWF_TIME_REFERENCE_LOW>" +
        start +
        "</BWF_TIME_REFERENCE_LOW>\n"
        "    <BWF_TIME_REFERENCE_HIGH>0</BWF_TIME_REFERENCE_HIGH>\n"
        "  </BEXT>\n"
        "</BWFXML>\n";
    if (text.size() < padTo) text.append(padTo - text.size(), ' ');
    return text;
}

std::string Samples() { return ExampleTone::Samples(1000, 2); }

std::string File() {
    Payload::Fmt fmt;
    fmt.channels = 2;
    fmt.rate = kRate;
    fmt.bits = 24;
    return AudioFileWriter::Wave()
        .Chunk("bext", BextPayload())
        .Chunk("fmt ", Payload::FmtChunk(fmt))
        .Chunk("data", Samples())
        .Chunk("iXML", IxmlPayload())
        .Bytes();
}

}  // namespace ExampleTake
