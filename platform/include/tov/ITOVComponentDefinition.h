#pragma once
#include "tov/ITOVDefinition.h"

inline constexpr _tovUID IID_ITOVComponentDefinition = {
    0x1718A226, 0x7FD0, 0x11D6, {0xBD, 0x1D, 0x00, 0x30, 0x65, 0x42, 0xA0, 0x24}};

/// One component of a module: its identity, type, version and class.
/// `Initialize` also sets TOVATTR_Component_CLSID to `clsid`.
class ITOVComponentDefinition : public ITOVDefinition {
public:
    virtual TOVRESULT Initialize(const _tovUID& compID, const _tovUID& compType, unsigned int major, unsigned int minor,
                                 const _tovUID& clsid, const wchar_t* name) = 0;
    virtual TOVRESULT GetComponentID(_tovUID* out) = 0;
    virtual TOVRESULT GetClassID(_tovUID* out) = 0;
    /// The name stays owned by the definition.
    virtual const wchar_t* GetName() = 0;

protected:
    ~ITOVComponentDefinition() = default;
};
