#pragma once
/// The host's feature-toggle manager: named unsigned 32-bit values in groups,
/// registered once with a default and then read and set by path. The toggles
/// live as long as the host, not as long as one manager object.
#include <cstdint>

#include "tov/ITOVString.h"
#include "tov/ITOVUnknown.h"

inline constexpr _tovUID IID_IFTFManager = {
    0x5E57F703, 0x0FA1, 0x3B38, {0xBB, 0x53, 0x51, 0xD7, 0x7F, 0x6B, 0x53, 0xAC}};
inline constexpr _tovUID TOVCompID_FTFManager = {
    0x9FAC2F14, 0xCA6D, 0x3DD0, {0x81, 0x85, 0xA7, 0x10, 0xE2, 0xFA, 0x34, 0x8E}};

/// Paths and groups are UTF-8 texts. A path that is not registered answers
/// ZEB_E_NOTFOUND from the operations that return a result.
class IFTFManager : public ITOVUnknown {
public:
    /// How many toggles are registered.
    virtual TOVRESULT GetToggleCount(uint32_t* count) = 0;
    /// The path of toggle `index`, in order of registration; the caller owns the string.
    virtual TOVRESULT GetTogglePath(uint32_t index, ITOVString** path) = 0;
    /// The group a toggle was registered in; the caller owns the string.
    virtual TOVRESULT GetToggleGroup(const char* path, ITOVString** group) = 0;
    /// The value a toggle was registered with.
    virtual TOVRESULT GetToggleDefault(const char* path, uint32_t* value) = 0;
    /// Sets a toggle back to its default.
    virtual TOVRESULT ResetToggle(const char* path) = 0;
    /// Forgets a toggle and its value.
    virtual TOVRESULT UnregisterToggle(const char* path) = 0;

    /// Registers `path` with `defaultValue` as its value. A path already
    /// registered is refused with ZEB_E_ALREADYSET and keeps its value.
    virtual TOVRESULT RegisterToggle(const char* path, uint32_t defaultValue, const char* group) = 0;
    virtual TOVRESULT GetToggleValue(const char* path, uint32_t* value) = 0;
    virtual TOVRESULT SetToggleValue(const char* path, uint32_t value) = 0;
    /// 1 when `path` is registered, else 0.
    virtual int32_t IsToggleRegistered(const char* path) = 0;

protected:
    ~IFTFManager() = default;
};
