#pragma once
/// The host's settings: values the user chose in the host, each named by an
/// identifier. They live as long as the host, not as long as one settings object.
#include <cstdint>

#include "tov/ITOVUnknown.h"

inline constexpr _tovUID IID_IHostSettings = {
    0x71C45980, 0x1345, 0x419D, {0xAB, 0x91, 0xE4, 0x0C, 0x80, 0x37, 0x73, 0x30}};
inline constexpr _tovUID CompID_HostSettings = {
    0xBF17159D, 0x1581, 0x453E, {0x83, 0xBD, 0x9E, 0x0E, 0x4A, 0xF5, 0x7B, 0x40}};

/// Whether monophonic Broadcast Wave files of one recording are grouped into one clip.
inline constexpr _tovUID ZEBHostSetting_AutodetectMonophonicBroadcastWaveGroups = {
    0xEB4E9956, 0x1768, 0x4F64, {0x83, 0xDF, 0x28, 0xDC, 0xCC, 0x34, 0xC2, 0x50}};

/// The `size` argument is the size in bits of the value passed; the host's
/// settings are unsigned 32-bit numbers, and callers pass 16 by long habit,
/// which the host accepts for them too (any size from 1 to 32 bits reads and
/// writes the whole 32-bit value). A size of 0 or above 32 is TOV_E_INVALIDARG.
class IHostSettings : public ITOVUnknown {
public:
    /// Stores a value; it then answers every GetSetting of this host.
    virtual TOVRESULT SetSetting(const _tovUID& setting, uint32_t size, uint32_t value) = 0;
    /// The value of `setting`; ZEB_E_NOTFOUND for a setting the host was never given.
    virtual TOVRESULT GetSetting(const _tovUID& setting, uint32_t size, uint32_t* value) = 0;

protected:
    ~IHostSettings() = default;
};
