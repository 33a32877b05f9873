// A tiny plug-in module for the host's loading tests: one component that
// answers ITestEcho, and the six exports. Build variants leave an export out
// or fail the start-up.
#include "TestEcho.h"
#include "tov/ITOVComponentFactory.h"
#include "tov/ITOVConsole.h"
#include "tov/TOVPluginExports.h"
#include "tov/sdk/CTOVClassFactory.h"
#include "tov/sdk/TOVComponent.h"
#include "tov/sdk/TOVPtr.h"

namespace {

class TestEcho : public ITestEcho, public CTOVUnknown {
public:
    static TOVRESULT TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out) {
        return TOVCreateComponent<TestEcho>(host, outer, iid, out);
    }
    explicit TestEcho(ITOVUnknown* outer) : CTOVUnknown(outer) {}

    TOV_FORWARD_UNKNOWN
    int Echo(int value) override { return value + 1; }

    TOVRESULT InternalQueryInterface(const _tovUID& iid, void** out) override {
        return TOVGuarded([&] {
            if (!out) return TOV_E_INVALIDARG;
            if (iid == IID_ITestEcho) return TOVExpose<ITestEcho>(this, out);
            return CTOVUnknown::InternalQueryInterface(iid, out);
        });
    }
};

// Held from start-up to shutdown, as a real module holds the host's services.
TOVPtr<ITOVConsole> s_console;

}  // namespace

TOV_EXPORT TOVRESULT TOVRegisterPlugin(ITOVUnknown* host, ITOVPluginDefinition** out) {
    return TOVGuarded([&] {
        if (!host || !out) return TOV_E_POINTER;
        *out = nullptr;
        TOVPtr<ITOVComponentFactory> factory;
        TOVCheck(host->QueryInterface(IID_ITOVComponentFactory, factory.Out()));
        TOVPtr<ITOVPluginDefinition> definition;
        TOVCheck(
            factory->CreateComponent(TOVCompID_PluginDefinition, nullptr, IID_ITOVPluginDefinition, definition.Out()));
        TOVCheck(
            definition->Initialize(TestModulePluginID, 2, 3, L"Test Module", TestModuleVendorID, L"Test Vendor", 1, 1));
        *out = definition.Detach();
        return TOV_OK;
    });
}

TOV_EXPORT TOVRESULT TOVRegisterComponent(ITOVUnknown* host, unsigned int index, ITOVComponentDefinition** out) {
    return TOVGuarded([&] {
        if (!host || !out) return TOV_E_POINTER;
        if (index > 0) return TOV_E_INVALIDARG;
        *out = nullptr;
        TOVPtr<ITOVComponentFactory> factory;
        TOVCheck(host->QueryInterface(IID_ITOVComponentFactory, factory.Out()));
        TOVPtr<ITOVComponentDefinition> definition;
        TOVCheck(factory->CreateComponent(TOVCompID_ComponentDefinition, nullptr, IID_ITOVComponentDefinition,
                                          definition.Out()));
        TOVCheck(
            definition->Initialize(CompID_TestEcho, TOVCompType_OrrinMediaAccess, 2, 3, CLSID_TestEcho, L"TestEcho"));
        *out = definition.Detach();
        return TOV_OK;
    });
}

TOV_EXPORT TOVRESULT TOVGetClassFactory(ITOVUnknown* host, const _tovUID& clsid, const _tovUID& iid, void** out) {
    if (!host || !out) return TOV_E_INVALIDARG;
    if (clsid == CLSID_TestEcho) return CTOVClassFactory::Create(TestEcho::TOVCreate, iid, out);
    return CLASS_E_CLASSNOTAVAILABLE;
}

TOV_EXPORT TOVRESULT TOVCanUnloadNow(ITOVUnknown* host) {
    if (!host) return TOV_E_INVALIDARG;
    return CTOVUnknown::GetActiveObjectCount() == 0 ? TOV_OK : TOV_E_NOTSUPPORTED;
}

TOV_EXPORT TOVRESULT TOVStartup(ITOVUnknown* host) {
#ifdef TEST_MODULE_FAIL_STARTUP
    (void)host;
    return TOV_E_FAIL;
#else
    return TOVGuarded([&] {
        TOVCheck(host->QueryInterface(IID_ITOVConsole, s_console.Out()));
        s_console->Print(kTOVDebugLevelStartup, L"%s %d.%d Loaded\n", "Test Module", 2, 3);
        return TOV_OK;
    });
#endif
}

#ifndef TEST_MODULE_OMIT_SHUTDOWN
TOV_EXPORT TOVRESULT TOVShutdown(ITOVUnknown*) {
    if (s_console) s_console->Print(kTOVDebugLevelException, L"%s Unloaded\n", "Test Module");
    s_console.Reset();
    return TOV_OK;
}
#endif
