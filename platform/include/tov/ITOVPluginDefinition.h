#pragma once
#include "tov/ITOVDefinition.h"

inline constexpr _tovUID IID_ITOVPluginDefinition = {
    0x9EA764EF, 0xBC2A, 0x41E9, {0xA7, 0xDE, 0x20, 0x9C, 0xB5, 0x46, 0xDF, 0xA9}};

/// What a module says of itself when the host catalogues it.
class ITOVPluginDefinition : public ITOVDefinition {
public:
    /// `flags` is passed on as the host's own value.
    virtual TOVRESULT Initialize(const _tovUID& pluginID, unsigned int major, unsigned int minor, const wchar_t* name,
                                 const _tovUID& vendorID, const wchar_t* vendorName, unsigned int componentCount,
                                 unsigned int flags) = 0;
    virtual TOVRESULT GetPluginID(_tovUID* out) = 0;
    /// The name stays owned by the definition.
    virtual const wchar_t* GetName() = 0;
    virtual unsigned int GetComponentCount() = 0;

protected:
    ~ITOVPluginDefinition() = default;
};
