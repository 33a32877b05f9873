#pragma once
/// The reference host: one object that is the component factory, the console
/// and the host's own definition, with a registry of built-in components and of
/// components of modules loaded from disk. It owns the toggle and settings
/// stores that its built-in toggle managers and settings objects share.
///
/// Ownership: `Create` hands out the only reference. Loaded modules hold
/// references to the host until they are shut down, so the owner calls
/// `UnloadAllModules` before dropping its reference.
#include <memory>
#include <string>
#include <vector>

#include "tov/ITOVComponentFactory.h"
#include "tov/ITOVConsole.h"
#include "tov/ITOVDefinition.h"
#include "tov/host/ComponentRegistry.h"
#include "tov/host/DefinitionAttributes.h"
#include "tov/host/HostConsole.h"
#include "tov/host/IHostStores.h"
#include "tov/host/PluginModule.h"
#include "tov/sdk/CTOVUnknown.h"
#include "tov/sdk/TOVPtr.h"

class TOVHost : public ITOVComponentFactory,
                public ITOVConsole,
                public ITOVDefinition,
                public IHostStores,
                public CTOVUnknown {
public:
    /// A host with its built-in components registered.
    static TOVPtr<TOVHost> Create();

    TOV_FORWARD_UNKNOWN

    // ITOVComponentFactory
    TOVRESULT CreateComponent(const _tovUID& compID, ITOVUnknown* outer, const _tovUID& iid, void** out) override;
    TOVRESULT GetClassFactory(const _tovUID& clsid, const _tovUID& iid, void** out) override;
    TOVRESULT GetComponentDefinition(const _tovUID& compID, const _tovUID& iid, void** out) override;

    // ITOVConsole
    TOVRESULT Write(uint32_t level, const wchar_t* text) override;
    TOVRESULT Print(uint32_t level, const wchar_t* format, ...) override;
    TOVRESULT PrintNarrow(uint32_t level, const char* format, ...) override;
    TOVRESULT PrintV(uint32_t level, const wchar_t* format, va_list args) override;
    TOVRESULT SetVerbosity(uint32_t levelMask) override;
    uint32_t GetVerbosity() override;

    // ITOVDefinition: the host's own name and version.
    TOVRESULT GetAttribute(const _tovUID& attribute, const _tovUID& type, void* out, unsigned int size) override;
    TOVRESULT SetAttribute(const _tovUID& attribute, const _tovUID& type, const void* value, int size) override;

    // IHostStores: for the host's own components.
    std::shared_ptr<HostToggleStore> ToggleStore() override { return m_Toggles; }
    std::shared_ptr<HostSettingValues> SettingStore() override { return m_Settings; }

    TOVRESULT InternalQueryInterface(const _tovUID& iid, void** out) override;

    /// The unknown that the host hands to modules and components.
    ITOVUnknown* AsUnknown() { return static_cast<ITOVComponentFactory*>(this); }
    HostConsole& Console() { return m_Console; }
    const ComponentRegistry& Registry() const { return m_Registry; }

    /// Registers a component whose class is built into the process.
    TOVRESULT RegisterBuiltin(const _tovUID& compID, const _tovUID& clsid, const wchar_t* name,
                              CTOVClassFactory::Creator creator);

    /// Loads a module, catalogues its plug-in and components, and starts it.
    /// On failure nothing of the module stays and `error` says why.
    TOVRESULT LoadModule(const std::string& path, std::string& error);
    /// Shuts a module down and unloads it. TOV_E_NOTSUPPORTED while its objects
    /// are alive (the module stays), ZEB_E_NOTFOUND for a path never loaded.
    TOVRESULT UnloadModule(const std::string& path);
    /// Shuts every module down, last loaded first. A module whose objects are
    /// still alive is shut down but kept mapped, so those objects stay callable.
    void UnloadAllModules();
    /// The plug-in definitions of the loaded modules, in load order.
    std::vector<ITOVPluginDefinition*> LoadedPlugins() const;

    explicit TOVHost(ITOVUnknown* outer);
    ~TOVHost() override;

private:
    struct LoadedModule {
        std::unique_ptr<PluginModule> module;
        TOVPtr<ITOVPluginDefinition> plugin;
    };

    TOVRESULT Catalogue(PluginModule& module, TOVPtr<ITOVPluginDefinition>& plugin, std::string& error);
    void ShutdownModule(LoadedModule& loaded, bool force);

    HostConsole m_Console;
    DefinitionAttributes m_Attributes;
    ComponentRegistry m_Registry;
    std::vector<LoadedModule> m_Modules;
    // Shared, so that a manager or settings object outliving the host stays valid.
    std::shared_ptr<HostToggleStore> m_Toggles = std::make_shared<HostToggleStore>();
    std::shared_ptr<HostSettingValues> m_Settings = std::make_shared<HostSettingValues>();
};
