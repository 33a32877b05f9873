// The module's six exports: what the host calls to catalogue the plug-in, to
// start and stop it, and to get the class factories of its components. Only
// the loadable module compiles this file; everything it calls is in the
// plug-in's library.
#include <cwchar>
#include <string>

#include "boundary/DynamicToggles.h"
#include "boundary/ModuleGlobals.h"
#include "boundary/OrloComponents.h"
#include "boundary/OrloRegInfo.h"
#include "startup/ZEBUtilLib.h"
#include "strings/ZEBString.h"
#include "tov/ITOVConsole.h"
#include "tov/TOVDefinitionIDs.h"
#include "tov/TOVPluginExports.h"
#include "tov/sdk/TOVFailureStyle.h"
#include "tov/sdk/TOVPtr.h"

using namespace OrloRegInfo;

namespace {

/// The patch and build numbers that every definition of the plug-in carries.
template <class Definition>
void SetVersionAttributes(Definition& definition) {
    TOVCheck(definition->SetAttribute(TOVATTR_Definition_PatchVersion, TOVTypeID_UInt32, &kVersionPatch,
                                      sizeof kVersionPatch));
    TOVCheck(definition->SetAttribute(TOVATTR_Definition_BuildVersion, TOVTypeID_UInt32, &kVersionBuild,
                                      sizeof kVersionBuild));
}

/// The plug-in's name as UTF-8, which the console's `%s` takes.
std::string PluginNameText() {
    ZEB::ZEBString name(reinterpret_cast<const unsigned int*>(kPluginName));
    return reinterpret_cast<const char*>(name.GetUTF8String());
}

}  // namespace

TOV_EXPORT TOVRESULT TOVStartup(ITOVUnknown* host) {
    return TOVGuarded([&] {
        TOVPtr<ITOVComponentFactory> factory;
        TOVCheck(host->QueryInterface(IID_ITOVComponentFactory, factory.Out()));
        TOVCheck(ZEB::ZEBInitialize(factory.Get()));
        ZEB::Impl::RegisterDynamicToggles(factory);

        TOVPtr<ITOVString> name;
        ZEB::ZEBString::CreateString(name.OutT());
        TOVCheck(name->Assign(kTOVUnicodeWCHAR, kPluginName, static_cast<unsigned int>(std::wcslen(kPluginName))));
        g_logger.SetName(name.Get());

        OrloReader::InitOrloReader(host);
        if (g_pConsole) {
            g_pConsole->Release();
            g_pConsole = nullptr;
        }
        // Having no console is not an error: the plug-in then says nothing.
        if (host->QueryInterface(IID_ITOVConsole, reinterpret_cast<void**>(&g_pConsole)) >= 0 && g_pConsole) {
            g_pConsole->Print(kTOVDebugLevelStartup, L"%s %d.%d.%d.%d Loaded", PluginNameText().c_str(), kVersionMajor,
                              kVersionMinor, kVersionPatch, kVersionBuild);
        } else if (g_pConsole) {
            g_pConsole->Release();
            g_pConsole = nullptr;
        }
        return TOV_OK;
    });
}

// No catch at all: a host without a console gets the failing result thrown
// back at it. This is the one export an exception may leave.
TOV_EXPORT TOVRESULT TOVShutdown(ITOVUnknown* host) {
    TOVPtr<ITOVConsole> console;
    TOVCheck(host->QueryInterface(IID_ITOVConsole, console.Out()));
    console->Print(kTOVDebugLevelException, L"%s Unloaded", PluginNameText().c_str());
    ZEB::ZEBTerminate();
    OrloReader::ShutdownOrloReader();
    if (ITOVConsole* global = g_pConsole) {
        g_pConsole = nullptr;
        global->Release();
    }
    return TOV_OK;
}

TOV_EXPORT TOVRESULT TOVRegisterPlugin(ITOVUnknown* host, ITOVPluginDefinition** out) {
    return TOVGuarded([&] {
        if (!host || !out) return TOV_E_POINTER;
        *out = nullptr;
        TOVPtr<ITOVDefinition> hostDefinition;
        TOVCheck(host->QueryInterface(IID_ITOVDefinition, hostDefinition.Out()));
        TOVPtr<ITOVComponentFactory> factory;
        TOVCheck(host->QueryInterface(IID_ITOVComponentFactory, factory.Out()));
        TOVPtr<ITOVPluginDefinition> definition;
        TOVCheck(
            factory->CreateComponent(TOVCompID_PluginDefinition, nullptr, IID_ITOVPluginDefinition, definition.Out()));
        TOVCheck(definition->Initialize(Orlo_PluginID, kVersionMajor, kVersionMinor, kPluginName, ORRIN_ZEB_VendorID,
                                        kVendorName, kOrloComponentCount, 1));
        TOVCheck(definition->SetAttribute(TOVATTR_Definition_Description, TOVTypeID_UnicodeString, kDescription, -1));
        SetVersionAttributes(definition);
        *out = definition.Detach();
        return TOV_OK;
    });
}

TOV_EXPORT TOVRESULT TOVRegisterComponent(ITOVUnknown* host, unsigned int index, ITOVComponentDefinition** out) {
    return TOVGuarded([&] {
        if (!host || !out) return TOV_E_POINTER;
        if (index >= kOrloComponentCount) return TOV_E_INVALIDARG;
        *out = nullptr;
        TOVPtr<ITOVComponentFactory> factory;
        TOVCheck(host->QueryInterface(IID_ITOVComponentFactory, factory.Out()));
        TOVPtr<ITOVComponentDefinition> definition;
        TOVCheck(factory->CreateComponent(TOVCompID_ComponentDefinition, nullptr, IID_ITOVComponentDefinition,
                                          definition.Out()));
        const OrloComponent& row = kOrloComponents[index];
        TOVCheck(definition->Initialize(row.compID, TOVCompType_OrrinMediaAccess, kVersionMajor, kVersionMinor,
                                        row.clsid, row.name));
        SetVersionAttributes(definition);
        *out = definition.Detach();
        return TOV_OK;
    });
}

// Unlike TOVRegisterPlugin, a null host here is TOV_E_INVALIDARG: the two
// differ and hosts rely on each.
TOV_EXPORT TOVRESULT TOVGetClassFactory(ITOVUnknown* host, const _tovUID& clsid, const _tovUID& iid, void** out) {
    if (!host || !out) return TOV_E_INVALIDARG;
    for (const OrloComponent& row : kOrloComponents) {
        if (row.clsid != clsid) continue;
        if (!row.creator) break;
        return CTOVClassFactory::Create(row.creator, iid, out);
    }
    return CLASS_E_CLASSNOTAVAILABLE;
}

TOV_EXPORT TOVRESULT TOVCanUnloadNow(ITOVUnknown* host) {
    if (!host) return TOV_E_INVALIDARG;
    return CTOVUnknown::GetActiveObjectCount() != 0 ? TOV_E_NOTSUPPORTED : TOV_OK;
}
