#pragma once
/// The host's settings (CompID_HostSettings): a view over the host's one
/// settings store, so every settings object of a host sees the same values.
/// Created only through a host that has the store. A new host has no
/// setting: each answers ZEB_E_NOTFOUND until it is set.
///
/// How this implementation reads the interface: a size of 0 is
/// TOV_E_INVALIDARG like one above 32, and so is a null place for the value;
/// a refused GetSetting leaves `*value` as it was.
#include <memory>

#include "tov/IHostSettings.h"
#include "tov/host/IHostStores.h"
#include "tov/sdk/CTOVUnknown.h"

inline constexpr _tovUID CLSID_HostSettings = {
    0x92438821, 0x0585, 0x422A, {0xA8, 0x93, 0x3B, 0x3E, 0x40, 0xB1, 0xDA, 0x8F}};

class HostSettings : public IHostSettings, public CTOVUnknown {
public:
    static TOVRESULT TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out);
    explicit HostSettings(ITOVUnknown* outer) : CTOVUnknown(outer) {}

    TOV_FORWARD_UNKNOWN

    TOVRESULT SetSetting(const _tovUID& setting, uint32_t size, uint32_t value) override;
    TOVRESULT GetSetting(const _tovUID& setting, uint32_t size, uint32_t* value) override;

    /// Finds the host's settings store; fails without one.
    TOVRESULT InitializeInstance(ITOVUnknown* host) override;
    TOVRESULT InternalQueryInterface(const _tovUID& iid, void** out) override;

private:
    std::shared_ptr<HostSettingValues> m_Store;
};
