#include "tov/host/ComponentRegistry.h"

#include <algorithm>

TOVRESULT ComponentRegistry::Add(ITOVComponentDefinition* definition, CTOVClassFactory::Creator creator,
                                 PluginModule* module) {
    if (!definition || (!creator == !module)) return TOV_E_INVALIDARG;
    Entry entry{};
    TOVCheck(definition->GetComponentID(&entry.compID));
    TOVCheck(definition->GetClassID(&entry.clsid));
    if (FindComponent(entry.compID) || FindClass(entry.clsid)) return ZEB_E_ALREADYSET;
    entry.definition.Assign(definition);
    entry.creator = creator;
    entry.module = module;
    m_Entries.push_back(std::move(entry));
    return TOV_OK;
}

void ComponentRegistry::RemoveModule(const PluginModule* module) {
    m_Entries.erase(
        std::remove_if(m_Entries.begin(), m_Entries.end(), [module](const Entry& e) { return e.module == module; }),
        m_Entries.end());
}

const ComponentRegistry::Entry* ComponentRegistry::FindComponent(const _tovUID& compID) const {
    for (const Entry& e : m_Entries)
        if (e.compID == compID) return &e;
    return nullptr;
}

ComponentRegistry::Entry* ComponentRegistry::FindComponent(const _tovUID& compID) {
    return const_cast<Entry*>(static_cast<const ComponentRegistry*>(this)->FindComponent(compID));
}

const ComponentRegistry::Entry* ComponentRegistry::FindClass(const _tovUID& clsid) const {
    for (const Entry& e : m_Entries)
        if (e.clsid == clsid) return &e;
    return nullptr;
}
