#pragma once
/// The root interface: every interface's first three slots are these.
#include <cstdint>

#include "tov/TOVResult.h"
#include "tov/tovUID.h"

inline constexpr _tovUID IID_ITOVUnknown = {
    0x00000000, 0x0000, 0x0000, {0xC0, 0x00, 0x00, 0x00, 0x00, 0x00, 0x00, 0x46}};

class ITOVUnknown {
public:
    /// Hands out `*out` with one reference owned by the caller, or a failure and null.
    virtual TOVRESULT QueryInterface(const _tovUID& iid, void** out) = 0;
    /// Both counters return the new count.
    virtual uint32_t AddRef() = 0;
    virtual uint32_t Release() = 0;

protected:
    ~ITOVUnknown() = default;
};
