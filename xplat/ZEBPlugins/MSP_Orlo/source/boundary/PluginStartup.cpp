#include "boundary/PluginStartup.h"

#include "boundary/DynamicToggles.h"
#include "boundary/ModuleGlobals.h"
#include "tov/sdk/TOVFailureStyle.h"

PluginStartup::PluginStartup(ITOVUnknown* host) {
    m_Result = TOVGuarded([&] {
        OrloReader::InitOrloReader(host);
        void* console = nullptr;
        TOVCheck(host->QueryInterface(IID_ITOVConsole, &console));
        g_pConsole = static_cast<ITOVConsole*>(console);
        TOVPtr<ITOVComponentFactory> factory;
        factory.Assign(OrloReader::s_pComponentFactory);
        ZEB::Impl::RegisterDynamicToggles(factory);
        return TOV_OK;
    });
}

PluginStartup::~PluginStartup() {
    if (ITOVConsole* console = g_pConsole) {
        g_pConsole = nullptr;
        console->Release();
    }
    OrloReader::ShutdownOrloReader();
}
