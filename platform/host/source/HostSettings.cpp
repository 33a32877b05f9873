#include "tov/host/HostSettings.h"

#include "tov/sdk/TOVComponent.h"

namespace {

/// Settings are 32-bit values; any size in bits up to that reads and writes the whole value.
bool IsValidSize(uint32_t size) { return size >= 1 && size <= 32; }

}  // namespace

TOVRESULT HostSettings::TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out) {
    return TOVCreateComponent<HostSettings>(host, outer, iid, out);
}

TOVRESULT HostSettings::InitializeInstance(ITOVUnknown* host) {
    return TOVGuarded([&] {
        m_Store = FindHostStores(host)->SettingStore();
        return TOV_OK;
    });
}

TOVRESULT HostSettings::SetSetting(const _tovUID& setting, uint32_t size, uint32_t value) {
    return TOVGuarded([&] {
        if (!IsValidSize(size)) return TOV_E_INVALIDARG;
        (*m_Store)[setting] = value;
        return TOV_OK;
    });
}

TOVRESULT HostSettings::GetSetting(const _tovUID& setting, uint32_t size, uint32_t* value) {
    return TOVGuarded([&] {
        if (!value || !IsValidSize(size)) return TOV_E_INVALIDARG;
        auto it = m_Store->find(setting);
        if (it == m_Store->end()) return ZEB_E_NOTFOUND;
        *value = it->second;
        return TOV_OK;
    });
}

TOVRESULT HostSettings::InternalQueryInterface(const _tovUID& iid, void** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        if (iid == IID_IHostSettings) return TOVExpose<IHostSettings>(this, out);
        return CTOVUnknown::InternalQueryInterface(iid, out);
    });
}
