#include "boundary/ModuleGlobals.h"

#include "tov/sdk/TOVFailureStyle.h"

ZEB::ZEBLogger g_logger;
ITOVConsole* g_pConsole = nullptr;

namespace OrloReader {

ITOVComponentFactory* s_pComponentFactory = nullptr;

void InitOrloReader(ITOVUnknown* host) {
    if (s_pComponentFactory) return;
    if (!host) throw static_cast<int>(TOV_E_POINTER);
    void* factory = nullptr;
    TOVCheck(host->QueryInterface(IID_ITOVComponentFactory, &factory));
    s_pComponentFactory = static_cast<ITOVComponentFactory*>(factory);
}

void ShutdownOrloReader() {
    if (ITOVComponentFactory* factory = s_pComponentFactory) {
        s_pComponentFactory = nullptr;
        factory->Release();
    }
}

}  // namespace OrloReader
