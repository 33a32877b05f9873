#pragma once
#include "tov/ITOVUnknown.h"

inline constexpr _tovUID IID_ITOVClassFactory = {
    0x80996EEE, 0x7FCF, 0x11D6, {0xAC, 0xA8, 0x00, 0x30, 0x65, 0x42, 0xA0, 0x24}};

/// Makes instances of one component class.
class ITOVClassFactory : public ITOVUnknown {
public:
    /// `host` is the creating host's unknown, handed on to the component's
    /// `InitializeInstance`; `outer` is the aggregating object or null.
    virtual TOVRESULT CreateInstance(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out) = 0;

protected:
    ~ITOVClassFactory() = default;
};
