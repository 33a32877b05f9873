#include "tov/host/TOVHost.h"

#include "tov/host/HostComponentDefinition.h"
#include "tov/host/HostFTFManager.h"
#include "tov/host/HostPluginDefinition.h"
#include "tov/host/HostSettings.h"
#include "tov/host/HostString.h"
#include "tov/host/HostUIDGeneratorMD5.h"
#include "tov/host/HostXmlParser.h"
#include "tov/host/HostXmlSaxParser.h"
#include "tov/host/HostXmlWriter.h"
#include "tov/sdk/TOVComponent.h"

namespace {

constexpr _tovUID CLSID_HostString = {0xE9B8BDBF, 0x5358, 0x4802, {0xAB, 0x7C, 0x5A, 0xC4, 0xE9, 0x44, 0xCC, 0xB1}};

constexpr wchar_t kHostName[] = L"Orlo reference host";

}  // namespace

TOVPtr<TOVHost> TOVHost::Create() {
    TOVPtr<TOVHost> host(new TOVHost(nullptr));
    host->InternalAddRef();
    TOVCheck(host->RegisterBuiltin(TOVCompID_PluginDefinition, CLSID_HostPluginDefinition, L"PluginDefinition",
                                   HostPluginDefinition::TOVCreate));
    TOVCheck(host->RegisterBuiltin(TOVCompID_ComponentDefinition, CLSID_HostComponentDefinition, L"ComponentDefinition",
                                   HostComponentDefinition::TOVCreate));
    TOVCheck(host->RegisterBuiltin(TOVCompID_TOVString, CLSID_HostString, L"TOVString", HostString::TOVCreate));
    TOVCheck(host->RegisterBuiltin(UTIL::CompID_TOVXmlReader, CLSID_HostXmlParser, L"TOVXmlReader",
                                   HostXmlParser::TOVCreate));
    TOVCheck(host->RegisterBuiltin(UTIL::CompID_TOVXmlSaxReader, CLSID_HostXmlSaxParser, L"TOVXmlSaxReader",
                                   HostXmlSaxParser::TOVCreate));
    TOVCheck(host->RegisterBuiltin(UTIL::CompID_TOVXmlWriter, CLSID_HostXmlWriter, L"TOVXmlWriter",
                                   HostXmlWriter::TOVCreate));
    TOVCheck(
        host->RegisterBuiltin(TOVCompID_FTFManager, CLSID_HostFTFManager, L"FTFManager", HostFTFManager::TOVCreate));
    TOVCheck(host->RegisterBuiltin(CompID_HostSettings, CLSID_HostSettings, L"HostSettings", HostSettings::TOVCreate));
    TOVCheck(host->RegisterBuiltin(TOVCompID_UIDGenerator, CLSID_HostUIDGeneratorMD5, L"UIDGeneratorMD5",
                                   HostUIDGeneratorMD5::TOVCreate));
    return host;
}

TOVHost::TOVHost(ITOVUnknown* outer) : CTOVUnknown(outer) {
    m_Attributes.Set(TOVATTR_Definition_Description, TOVTypeID_UnicodeString, kHostName, -1);
}

TOVHost::~TOVHost() { UnloadAllModules(); }

TOVRESULT TOVHost::RegisterBuiltin(const _tovUID& compID, const _tovUID& clsid, const wchar_t* name,
                                   CTOVClassFactory::Creator creator) {
    return TOVGuarded([&] {
        TOVPtr<ITOVComponentDefinition> definition;
        TOVCheck(
            HostComponentDefinition::TOVCreate(AsUnknown(), nullptr, IID_ITOVComponentDefinition, definition.Out()));
        TOVCheck(definition->Initialize(compID, TOVCompType_HostService, 1, 0, clsid, name));
        return m_Registry.Add(definition.Get(), creator, nullptr);
    });
}

TOVRESULT TOVHost::CreateComponent(const _tovUID& compID, ITOVUnknown* outer, const _tovUID& iid, void** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        *out = nullptr;
        ComponentRegistry::Entry* entry = m_Registry.FindComponent(compID);
        if (!entry) return ZEB_E_NOTFOUND;
        TOVPtr<ITOVClassFactory> factory;
        TOVCheck(GetClassFactory(entry->clsid, IID_ITOVClassFactory, factory.Out()));
        const TOVRESULT result = factory->CreateInstance(AsUnknown(), outer, iid, out);
        if (result >= 0) ++entry->created;
        return result;
    });
}

TOVRESULT TOVHost::GetClassFactory(const _tovUID& clsid, const _tovUID& iid, void** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        *out = nullptr;
        const ComponentRegistry::Entry* entry = m_Registry.FindClass(clsid);
        if (!entry) return CLASS_E_CLASSNOTAVAILABLE;
        if (entry->creator) return CTOVClassFactory::Create(entry->creator, iid, out);
        return entry->module->GetClassFactory(AsUnknown(), clsid, iid, out);
    });
}

TOVRESULT TOVHost::GetComponentDefinition(const _tovUID& compID, const _tovUID& iid, void** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        *out = nullptr;
        const ComponentRegistry::Entry* entry = m_Registry.FindComponent(compID);
        if (!entry) return ZEB_E_NOTFOUND;
        return entry->definition->QueryInterface(iid, out);
    });
}

TOVRESULT TOVHost::Write(uint32_t level, const wchar_t* text) {
    return TOVGuarded([&] { return m_Console.Write(level, text); });
}

TOVRESULT TOVHost::Print(uint32_t level, const wchar_t* format, ...) {
    va_list args;
    va_start(args, format);
    const TOVRESULT result = PrintV(level, format, args);
    va_end(args);
    return result;
}

TOVRESULT TOVHost::PrintNarrow(uint32_t level, const char* format, ...) {
    va_list args;
    va_start(args, format);
    const TOVRESULT result = TOVGuarded([&] { return m_Console.PrintNarrowV(level, format, args); });
    va_end(args);
    return result;
}

TOVRESULT TOVHost::PrintV(uint32_t level, const wchar_t* format, va_list args) {
    return TOVGuarded([&] { return m_Console.PrintV(level, format, args); });
}

TOVRESULT TOVHost::SetVerbosity(uint32_t levelMask) {
    m_Console.SetVerbosity(levelMask);
    return TOV_OK;
}

uint32_t TOVHost::GetVerbosity() { return m_Console.GetVerbosity(); }

TOVRESULT TOVHost::GetAttribute(const _tovUID& attribute, const _tovUID& type, void* out, unsigned int size) {
    return TOVGuarded([&] { return m_Attributes.Get(attribute, type, out, size); });
}

TOVRESULT TOVHost::SetAttribute(const _tovUID& attribute, const _tovUID& type, const void* value, int size) {
    return TOVGuarded([&] { return m_Attributes.Set(attribute, type, value, size); });
}

TOVRESULT TOVHost::InternalQueryInterface(const _tovUID& iid, void** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        if (iid == IID_ITOVComponentFactory) return TOVExpose<ITOVComponentFactory>(this, out);
        if (iid == IID_ITOVConsole) return TOVExpose<ITOVConsole>(this, out);
        if (iid == IID_ITOVDefinition) return TOVExpose<ITOVDefinition>(this, out);
        if (iid == IID_IHostStores) return TOVExpose<IHostStores>(this, out);
        return CTOVUnknown::InternalQueryInterface(iid, out);
    });
}

TOVRESULT TOVHost::LoadModule(const std::string& path, std::string& error) {
    return TOVGuarded([&] {
        TOVRESULT result = TOV_OK;
        std::unique_ptr<PluginModule> module = PluginModule::Open(path, result, error);
        if (!module) return result;
        TOVPtr<ITOVPluginDefinition> plugin;
        result = Catalogue(*module, plugin, error);
        if (result >= 0) {
            result = module->Startup(AsUnknown());
            if (result < 0) error = "module " + path + " failed to start";
        }
        if (result < 0) {
            m_Registry.RemoveModule(module.get());
            if (module->CanUnloadNow(AsUnknown()) != TOV_OK) module->KeepLoaded();
            return result;
        }
        m_Modules.push_back(LoadedModule{std::move(module), std::move(plugin)});
        return TOV_OK;
    });
}

TOVRESULT TOVHost::Catalogue(PluginModule& module, TOVPtr<ITOVPluginDefinition>& plugin, std::string& error) {
    TOVRESULT result = module.RegisterPlugin(AsUnknown(), plugin.OutT());
    if (result < 0 || !plugin) {
        error = "module " + module.GetPath() + " did not describe its plug-in";
        return result < 0 ? result : TOV_E_POINTER;
    }
    const unsigned int count = plugin->GetComponentCount();
    for (unsigned int index = 0; index < count; ++index) {
        TOVPtr<ITOVComponentDefinition> definition;
        result = module.RegisterComponent(AsUnknown(), index, definition.OutT());
        if (result >= 0 && !definition) result = TOV_E_POINTER;
        if (result >= 0) result = m_Registry.Add(definition.Get(), nullptr, &module);
        if (result < 0) {
            error = "module " + module.GetPath() + " failed to register component " + std::to_string(index);
            return result;
        }
    }
    return TOV_OK;
}

TOVRESULT TOVHost::UnloadModule(const std::string& path) {
    return TOVGuarded([&] {
        for (auto it = m_Modules.begin(); it != m_Modules.end(); ++it) {
            if (it->module->GetPath() != path) continue;
            if (it->module->CanUnloadNow(AsUnknown()) != TOV_OK) return TOV_E_NOTSUPPORTED;
            ShutdownModule(*it, false);
            m_Modules.erase(it);
            return TOV_OK;
        }
        return ZEB_E_NOTFOUND;
    });
}

void TOVHost::UnloadAllModules() {
    while (!m_Modules.empty()) {
        ShutdownModule(m_Modules.back(), true);
        m_Modules.pop_back();
    }
}

void TOVHost::ShutdownModule(LoadedModule& loaded, bool force) {
    PluginModule& module = *loaded.module;
    // Shutdown is the one export allowed to throw; the host stops it here.
    try {
        module.Shutdown(AsUnknown());
    } catch (...) {
        m_Console.Write(kTOVDebugLevelWarning, L"a module threw from its shutdown");
    }
    m_Registry.RemoveModule(&module);
    loaded.plugin.Reset();
    if (force && module.CanUnloadNow(AsUnknown()) != TOV_OK) module.KeepLoaded();
}

std::vector<ITOVPluginDefinition*> TOVHost::LoadedPlugins() const {
    std::vector<ITOVPluginDefinition*> plugins;
    for (const LoadedModule& loaded : m_Modules) plugins.push_back(loaded.plugin.Get());
    return plugins;
}
