#include "tov/host/HostFTFManager.h"

#include "tov/host/HostText.h"
#include "tov/host/IHostStores.h"
#include "tov/sdk/TOVComponent.h"

TOVRESULT HostFTFManager::TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out) {
    return TOVCreateComponent<HostFTFManager>(host, outer, iid, out);
}

TOVRESULT HostFTFManager::InitializeInstance(ITOVUnknown* host) {
    return TOVGuarded([&] {
        m_Store = FindHostStores(host)->ToggleStore();
        return TOV_OK;
    });
}

HostToggleStore::Toggle& HostFTFManager::Lookup(const char* path) {
    if (!path) throw static_cast<int>(TOV_E_INVALIDARG);
    HostToggleStore::Toggle* toggle = m_Store->Find(path);
    if (!toggle) throw static_cast<int>(ZEB_E_NOTFOUND);
    return *toggle;
}

TOVRESULT HostFTFManager::GetToggleCount(uint32_t* count) {
    return TOVGuarded([&] {
        if (!count) return TOV_E_INVALIDARG;
        *count = static_cast<uint32_t>(m_Store->Toggles().size());
        return TOV_OK;
    });
}

TOVRESULT HostFTFManager::GetTogglePath(uint32_t index, ITOVString** path) {
    return TOVGuarded([&] {
        if (!path) return TOV_E_INVALIDARG;
        *path = nullptr;
        if (index >= m_Store->Toggles().size()) return TOV_E_OUTOFRANGE;
        return HostText::Make(m_Store->Toggles()[index].path, path);
    });
}

TOVRESULT HostFTFManager::GetToggleGroup(const char* path, ITOVString** group) {
    return TOVGuarded([&] {
        if (!group) return TOV_E_INVALIDARG;
        *group = nullptr;
        return HostText::Make(Lookup(path).group, group);
    });
}

TOVRESULT HostFTFManager::GetToggleDefault(const char* path, uint32_t* value) {
    return TOVGuarded([&] {
        if (!value) return TOV_E_INVALIDARG;
        *value = Lookup(path).defaultValue;
        return TOV_OK;
    });
}

TOVRESULT HostFTFManager::ResetToggle(const char* path) {
    return TOVGuarded([&] {
        HostToggleStore::Toggle& toggle = Lookup(path);
        toggle.value = toggle.defaultValue;
        return TOV_OK;
    });
}

TOVRESULT HostFTFManager::UnregisterToggle(const char* path) {
    return TOVGuarded([&] {
        if (!path) return TOV_E_INVALIDARG;
        return m_Store->Unregister(path);
    });
}

TOVRESULT HostFTFManager::RegisterToggle(const char* path, uint32_t defaultValue, const char* group) {
    return TOVGuarded([&] {
        if (!path || !group) return TOV_E_INVALIDARG;
        return m_Store->Register(path, defaultValue, group);
    });
}

TOVRESULT HostFTFManager::GetToggleValue(const char* path, uint32_t* value) {
    return TOVGuarded([&] {
        if (!value) return TOV_E_INVALIDARG;
        *value = Lookup(path).value;
        return TOV_OK;
    });
}

TOVRESULT HostFTFManager::SetToggleValue(const char* path, uint32_t value) {
    return TOVGuarded([&] {
        Lookup(path).value = value;
        return TOV_OK;
    });
}

int32_t HostFTFManager::IsToggleRegistered(const char* path) {
    // Only the copy of the path into a string can throw (out of memory); no
    // exception leaves a slot, and a toggle that cannot be looked up counts as not there.
    try {
        return path && m_Store->Find(path) ? 1 : 0;
    } catch (...) {
        return 0;
    }
}

TOVRESULT HostFTFManager::InternalQueryInterface(const _tovUID& iid, void** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        if (iid == IID_IFTFManager) return TOVExpose<IFTFManager>(this, out);
        return CTOVUnknown::InternalQueryInterface(iid, out);
    });
}
