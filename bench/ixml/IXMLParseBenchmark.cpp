// Parsing a typical iXML block of about 4 KB into IXMLData, as every file
// with an iXML chunk costs on import; and the memory and time of a chunk of
// 60 MB in one text node, which a parse must keep within twice its size.
#include <benchmark/benchmark.h>
#include <libxml/parser.h>
#include <sys/wait.h>
#include <unistd.h>

#include <chrono>
#include <cstdio>
#include <fstream>
#include <string>

#include "TestHost.h"
#include "reader/ixml/ParceRawIXML.h"
#include "startup/ZEBUtilLib.h"
#include "xml/ZEBXmlDoc.h"

namespace {

std::string TypicalIxml() {
    std::string xml =
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<BWFXML>\n"
        "  <IXML_VERSION>2.10</IXML_VERSION>\n  <PROJECT>Night Shoot</PROJECT>\n  <SCENE>42A</SCENE>\n"
        "  <TAKE>3</TAKE>\n  <TAPE>DAY07</TAPE>\n  <CIRCLED>TRUE</CIRCLED>\n"
        "  <FILE_UID>RCD2024051713451000000001</FILE_UID>\n  <UBITS>17052400</UBITS>\n"
        "  <NOTE>plane overhead at the end</NOTE>\n  <NO_GOOD>FALSE</NO_GOOD>\n"
        "  <FALSE_START>FALSE</FALSE_START>\n  <WILD_TRACK>FALSE</WILD_TRACK>\n  <USER>Boom op: Sam</USER>\n"
        "  <SPEED>\n    <MASTER_SPEED>24000/1001</MASTER_SPEED>\n    <CURRENT_SPEED>24000/1001</CURRENT_SPEED>\n"
        "    <TIMECODE_RATE>24000/1001</TIMECODE_RATE>\n    <TIMECODE_FLAG>NDF</TIMECODE_FLAG>\n"
        "    <FILE_SAMPLE_RATE>48000</FILE_SAMPLE_RATE>\n    <AUDIO_BIT_DEPTH>24</AUDIO_BIT_DEPTH>\n"
        "    <DIGITIZER_SAMPLE_RATE>48000</DIGITIZER_SAMPLE_RATE>\n"
        "    <TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_HI>0</TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_HI>\n"
        "    <TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_LO>172800000</TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_LO>\n"
        "    <TIMESTAMP_SAMPLE_RATE>48000</TIMESTAMP_SAMPLE_RATE>\n  </SPEED>\n"
        "  <TRACK_LIST>\n    <TRACK_COUNT>8</TRACK_COUNT>\n";
    for (int i = 1; i <= 8; ++i) {
        const std::string n = std::to_string(i);
        xml += "    <TRACK>\n      <CHANNEL_INDEX>" + n + "</CHANNEL_INDEX>\n      <INTERLEAVE_INDEX>" + n +
               "</INTERLEAVE_INDEX>\n      <NAME>Lav " + n + "</NAME>\n      <FUNCTION>NONE</FUNCTION>\n    </TRACK>\n";
    }
    xml +=
        "  </TRACK_LIST>\n  <HISTORY>\n    <ORIGINAL_FILENAME>42A_03.WAV</ORIGINAL_FILENAME>\n"
        "    <PARENT_FILENAME>42A_03.WAV</PARENT_FILENAME>\n  </HISTORY>\n"
        "  <FILE_SET>\n    <TOTAL_FILES>1</TOTAL_FILES>\n    <FAMILY_UID>RCD2024051713451000000001</FAMILY_UID>\n"
        "    <FILE_SET_INDEX>A</FILE_SET_INDEX>\n  </FILE_SET>\n  <BEXT>\n"
        "    <BWF_DESCRIPTION>sSCENE=42A sTAKE=3</BWF_DESCRIPTION>\n    <BWF_ORIGINATOR>Recorder</BWF_ORIGINATOR>\n"
        "    <BWF_ORIGINATION_DATE>2024-05-17</BWF_ORIGINATION_DATE>\n"
        "    <BWF_ORIGINATION_TIME>13:45:10</BWF_ORIGINATION_TIME>\n  </BEXT>\n";
    // Recorders reserve room for later edits with a comment or filler.
    while (xml.size() < 4000) xml += "  <!-- reserved for later edits by the recorder -->\n";
    return xml + "</BWFXML>\n";
}

void BM_ParceRawIXML(benchmark::State& state) {
    TestHost host;
    ZEB::ZEBInitialize(host.Get());
    const std::string xml = TypicalIxml();
    for (auto _ : state) {
        Chunks::IXML::IXMLData data;
        const TOVRESULT result = Chunks::IXML::ParceRawIXML(xml, host.Get(), data);
        if (result != TOV_OK || !data.parsed) state.SkipWithError("the document did not parse");
        benchmark::DoNotOptimize(data);
    }
    state.SetLabel(std::to_string(xml.size()) + " bytes");
    ZEB::ZEBTerminate();
}
BENCHMARK(BM_ParceRawIXML)->Unit(benchmark::kMicrosecond);

// The parts of that cost: libxml2 alone, as the host's reader calls it...
void BM_LibXml2Alone(benchmark::State& state) {
    const std::string xml = TypicalIxml();
    for (auto _ : state) {
        xmlDocPtr doc = xmlReadMemory(xml.data(), static_cast<int>(xml.size()), nullptr, "UTF-8",
                                      XML_PARSE_NONET | XML_PARSE_NOBLANKS | XML_PARSE_COMPACT);
        benchmark::DoNotOptimize(doc);
        xmlFreeDoc(doc);
    }
}
BENCHMARK(BM_LibXml2Alone)->Unit(benchmark::kMicrosecond);

// ...and the text handed over as a host string and parsed into a document,
// before any element is read.
void BM_DocumentLoad(benchmark::State& state) {
    TestHost host;
    ZEB::ZEBInitialize(host.Get());
    const std::string xml = TypicalIxml();
    for (auto _ : state) {
        const ZEB::ZEBString text(reinterpret_cast<const unsigned char*>(xml.c_str()));
        ZEB::XMLUtils::ZEBXmlDoc document(host.Get());
        if (document.Load(text) != TOV_OK) state.SkipWithError("the document did not load");
    }
    ZEB::ZEBTerminate();
}
BENCHMARK(BM_DocumentLoad)->Unit(benchmark::kMicrosecond);

// A kilobyte figure of this process's status, such as VmRSS or VmHWM.
long StatusKB(const std::string& field) {
    std::ifstream status("/proc/self/status");
    std::string line;
    while (std::getline(status, line))
        if (line.compare(0, field.size() + 1, field + ":") == 0) return std::stol(line.substr(field.size() + 1));
    return -1;
}

struct HugeParse {
    double seconds = 0;
    long growthKB = -1;
};

// One parse in a child process, so that its peak memory is its own: the
// child makes the chunk's text, sets its peak to what it holds, parses, and
// reports the time and how far the peak rose.
HugeParse ParseInChild(const std::string& head, size_t noteBytes, const std::string& tail) {
    int channel[2];
    HugeParse result;
    if (pipe(channel) != 0) return result;
    const pid_t child = fork();
    if (child == 0) {
        std::string xml;
        xml.reserve(head.size() + noteBytes + tail.size());
        xml.append(head).append(noteBytes, 'n').append(tail);
        TestHost host;
        ZEB::ZEBInitialize(host.Get());
        std::ofstream("/proc/self/clear_refs") << "5";
        const long before = StatusKB("VmRSS");
        const auto start = std::chrono::steady_clock::now();
        Chunks::IXML::IXMLData data;
        Chunks::IXML::ParceRawIXML(xml, host.Get(), data);
        result.seconds = std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
        result.growthKB = StatusKB("VmHWM") - before;
        ZEB::ZEBTerminate();
        const bool written = write(channel[1], &result, sizeof result) == sizeof result;
        _exit(written ? 0 : 1);
    }
    close(channel[1]);
    if (child > 0) {
        if (read(channel[0], &result, sizeof result) != sizeof result) result = HugeParse();
        waitpid(child, nullptr, 0);
    }
    close(channel[0]);
    return result;
}

void BM_ParceRawIXMLHugeNote(benchmark::State& state) {
    const size_t noteBytes = 60u << 20;
    const std::string head = "<?xml version=\"1.0\" encoding=\"UTF-8\"?><BWFXML><PROJECT>Night Shoot</PROJECT><NOTE>";
    const std::string tail = "</NOTE></BWFXML>";
    const double chunkKB = static_cast<double>(head.size() + noteBytes + tail.size()) / 1024;
    double growthKB = 0;
    for (auto _ : state) {
        const HugeParse parse = ParseInChild(head, noteBytes, tail);
        if (parse.growthKB < 0) state.SkipWithError("the child reported nothing");
        state.SetIterationTime(parse.seconds);
        growthKB = std::max(growthKB, static_cast<double>(parse.growthKB));
    }
    state.counters["peak_growth_MB"] = growthKB / 1024;
    state.counters["peak_growth_per_chunk"] = growthKB / chunkKB;
}
BENCHMARK(BM_ParceRawIXMLHugeNote)->UseManualTime()->Iterations(3)->Unit(benchmark::kMillisecond);

}  // namespace

BENCHMARK_MAIN();
