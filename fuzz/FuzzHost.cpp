#include "FuzzHost.h"

#include <cstdlib>

#include "startup/ZEBUtilLib.h"

TOVHost* StartFuzzHost() {
    static TOVPtr<TOVHost> host = TOVHost::Create();
    host->Console().SetVerbosity(~0u);
    host->Console().SetSink([](uint32_t, const std::string&) {});
    if (ZEB::ZEBInitialize(host.Get()) < 0) std::abort();
    return host.Get();
}
