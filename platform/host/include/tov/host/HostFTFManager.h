#pragma once
/// The host's feature-toggle manager (TOVCompID_FTFManager): a view over the
/// host's one toggle store, so every manager object of a host sees the same
/// toggles and values. Created only through a host that has the store.
///
/// How this implementation reads the interface:
/// - A null path or group, or a null place for a result, is TOV_E_INVALIDARG;
///   IsToggleRegistered answers 0 for a null path.
/// - Any text is a path, the empty one too; paths compare byte for byte.
/// - GetTogglePath past the count is TOV_E_OUTOFRANGE.
/// - A refused call leaves the places for results as they were, except that
///   string results are set to null first.
/// - A toggle unregistered and registered again goes to the end of the order.
#include <memory>

#include "tov/IFTFManager.h"
#include "tov/host/HostToggleStore.h"
#include "tov/sdk/CTOVUnknown.h"

inline constexpr _tovUID CLSID_HostFTFManager = {
    0x8163A0ED, 0x8078, 0x482B, {0xA8, 0xC8, 0x50, 0x1C, 0x75, 0xB5, 0x1B, 0x43}};

class HostFTFManager : public IFTFManager, public CTOVUnknown {
public:
    static TOVRESULT TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out);
    explicit HostFTFManager(ITOVUnknown* outer) : CTOVUnknown(outer) {}

    TOV_FORWARD_UNKNOWN

    TOVRESULT GetToggleCount(uint32_t* count) override;
    TOVRESULT GetTogglePath(uint32_t index, ITOVString** path) override;
    TOVRESULT GetToggleGroup(const char* path, ITOVString** group) override;
    TOVRESULT GetToggleDefault(const char* path, uint32_t* value) override;
    TOVRESULT ResetToggle(const char* path) override;
    TOVRESULT UnregisterToggle(const char* path) override;
    TOVRESULT RegisterToggle(const char* path, uint32_t defaultValue, const char* group) override;
    TOVRESULT GetToggleValue(const char* path, uint32_t* value) override;
    TOVRESULT SetToggleValue(const char* path, uint32_t value) override;
    int32_t IsToggleRegistered(const char* path) override;

    /// Finds the host's toggle store; fails without one.
    TOVRESULT InitializeInstance(ITOVUnknown* host) override;
    TOVRESULT InternalQueryInterface(const _tovUID& iid, void** out) override;

private:
    /// The toggle at `path`; a null path throws TOV_E_INVALIDARG, one not
    /// registered ZEB_E_NOTFOUND, both as an `int`.
    HostToggleStore::Toggle& Lookup(const char* path);

    std::shared_ptr<HostToggleStore> m_Store;
};
