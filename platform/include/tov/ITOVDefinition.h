#pragma once
/// A definition: a set of typed attributes that describe a host, plug-in or component.
#include "tov/ITOVUnknown.h"
#include "tov/TOVDefinitionIDs.h"

inline constexpr _tovUID IID_ITOVDefinition = {
    0x3634BBC2, 0x3EA5, 0x470E, {0xB5, 0x77, 0xF5, 0x42, 0x2A, 0xC6, 0x9A, 0x69}};

class ITOVDefinition : public ITOVUnknown {
public:
    /// Copies the attribute's value into `out`, which holds `size` bytes. Fails
    /// with ZEB_E_NOTFOUND for an unknown attribute, TOV_E_INVALIDARG when the
    /// type differs or `size` is too small.
    virtual TOVRESULT GetAttribute(const _tovUID& attribute, const _tovUID& type, void* out, unsigned int size) = 0;
    /// Stores a copy of `size` bytes of `value`; for TOVTypeID_UnicodeString a
    /// size of -1 means the zero-terminated length.
    virtual TOVRESULT SetAttribute(const _tovUID& attribute, const _tovUID& type, const void* value, int size) = 0;

protected:
    ~ITOVDefinition() = default;
};
