// libFuzzer target: the text of an iXML chunk, mended as the chunk mends it,
// parsed into IXMLData through the host's DOM and the document model.
#include <cstdint>
#include <string>

#include "FuzzHost.h"
#include "reader/ixml/IXMLTextParsers.h"
#include "reader/ixml/ParceRawIXML.h"

namespace {
ITOVComponentFactory* g_factory = nullptr;
}  // namespace

extern "C" int LLVMFuzzerInitialize(int*, char***) {
    g_factory = StartFuzzHost();
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
    std::string raw(reinterpret_cast<const char*>(data), size);
    Chunks::IXML::TruncateIXMLString(raw);
    Chunks::IXML::IXMLData parsed;
    // Any result is an answer; only a crash, a leak or a hang is a fault.
    Chunks::IXML::ParceRawIXML(raw, g_factory, parsed);
    return 0;
}
