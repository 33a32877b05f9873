#pragma once
/// The host's private way for its built-in services to reach what lives as
/// long as the host: a component asks the host unknown it is initialised with.
/// The slots hand out C++ objects, so only code built with the host calls
/// them; plug-ins see the toggles and settings through their interfaces only.
#include <cstdint>
#include <map>
#include <memory>

#include "tov/ITOVUnknown.h"
#include "tov/host/HostToggleStore.h"
#include "tov/sdk/TOVFailureStyle.h"
#include "tov/sdk/TOVPtr.h"

inline constexpr _tovUID IID_IHostStores = {
    0x7E5B83E3, 0x5A8E, 0x419B, {0xBB, 0xE6, 0x93, 0x68, 0xD2, 0x66, 0x60, 0x90}};

/// The host's settings by identifier.
using HostSettingValues = std::map<_tovUID, uint32_t>;

class IHostStores : public ITOVUnknown {
public:
    /// The one toggle store of this host, shared by whoever holds it.
    virtual std::shared_ptr<HostToggleStore> ToggleStore() = 0;
    /// The one settings store of this host, shared by whoever holds it.
    virtual std::shared_ptr<HostSettingValues> SettingStore() = 0;

protected:
    ~IHostStores() = default;
};

/// The stores of the host behind `host`. A null host throws ZEB_E_NOTREADY, a
/// host without stores the query's result, both as an `int`.
inline TOVPtr<IHostStores> FindHostStores(ITOVUnknown* host) {
    if (!host) throw static_cast<int>(ZEB_E_NOTREADY);
    TOVPtr<IHostStores> stores;
    TOVCheck(host->QueryInterface(IID_IHostStores, stores.Out()));
    return stores;
}
