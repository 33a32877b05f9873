#pragma once
/// The root of every AAF interface, and the map from an interface type to its
/// identifier that typed queries use.
#include "aaf/AAFInterfaceIDs.h"
#include "aaf/AAFResult.h"
#include "aaf/AAFTypes.h"

class IUnknown {
public:
    /// Hands out `*ppvObj` with one reference owned by the caller, or a failure and null.
    virtual AAFRESULT QueryInterface(REFIID riid, void** ppvObj) = 0;
    /// Both counters return the new count.
    virtual aafUInt32 AddRef() = 0;
    virtual aafUInt32 Release() = 0;

protected:
    ~IUnknown() = default;
};

/// `AAFInterfaceID<IAAFMob>::value` is IID_IAAFMob; each interface header adds its entry.
template <class Interface>
struct AAFInterfaceID;

#define AAF_INTERFACE_ID(Interface)                               \
    template <>                                                   \
    struct AAFInterfaceID<Interface> {                            \
        static constexpr const aafUID_t& value = IID_##Interface; \
    }

AAF_INTERFACE_ID(IUnknown);
