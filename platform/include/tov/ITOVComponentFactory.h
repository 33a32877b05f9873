#pragma once
#include "tov/ITOVUnknown.h"

inline constexpr _tovUID IID_ITOVComponentFactory = {
    0x382B6A96, 0x7FD0, 0x11D6, {0xBC, 0xFE, 0x00, 0x30, 0x65, 0x42, 0xA0, 0x24}};

/// The host's factory: every component reaches every other one through it.
class ITOVComponentFactory : public ITOVUnknown {
public:
    /// Creates the component registered as `compID` and queries it for `iid`.
    virtual TOVRESULT CreateComponent(const _tovUID& compID, ITOVUnknown* outer, const _tovUID& iid, void** out) = 0;
    /// The class factory behind class `clsid`, queried for `iid`.
    virtual TOVRESULT GetClassFactory(const _tovUID& clsid, const _tovUID& iid, void** out) = 0;
    /// The definition object of component `compID`, queried for `iid`.
    virtual TOVRESULT GetComponentDefinition(const _tovUID& compID, const _tovUID& iid, void** out) = 0;

protected:
    ~ITOVComponentFactory() = default;
};
