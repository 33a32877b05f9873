#pragma once
/// The host's table of components: identifier, class, definition, and where
/// the class comes from (a creator built into the host, or a loaded module).
#include <cstdint>
#include <vector>

#include "tov/ITOVComponentDefinition.h"
#include "tov/sdk/CTOVClassFactory.h"
#include "tov/sdk/TOVFailureStyle.h"
#include "tov/sdk/TOVPtr.h"

class PluginModule;

class ComponentRegistry {
public:
    struct Entry {
        _tovUID compID;
        _tovUID clsid;
        TOVPtr<ITOVComponentDefinition> definition;
        CTOVClassFactory::Creator creator;  ///< set for built-in classes
        PluginModule* module;               ///< set for classes of a module, not owned
        uint32_t created = 0;               ///< instances made through the host's factory
    };

    /// Adds a component described by `definition` (which holds its identifier
    /// and class). Exactly one of `creator` and `module` is given.
    /// ZEB_E_ALREADYSET when the identifier or class is already registered.
    TOVRESULT Add(ITOVComponentDefinition* definition, CTOVClassFactory::Creator creator, PluginModule* module);
    /// Drops every component of `module`.
    void RemoveModule(const PluginModule* module);
    void Clear() { m_Entries.clear(); }

    const Entry* FindComponent(const _tovUID& compID) const;
    Entry* FindComponent(const _tovUID& compID);
    const Entry* FindClass(const _tovUID& clsid) const;
    const std::vector<Entry>& Entries() const { return m_Entries; }

private:
    std::vector<Entry> m_Entries;
};
