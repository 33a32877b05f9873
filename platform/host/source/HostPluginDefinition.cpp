#include "tov/host/HostPluginDefinition.h"

#include "tov/sdk/TOVComponent.h"

TOVRESULT HostPluginDefinition::TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out) {
    return TOVCreateComponent<HostPluginDefinition>(host, outer, iid, out);
}

TOVRESULT HostPluginDefinition::Initialize(const _tovUID& pluginID, unsigned int major, unsigned int minor,
                                           const wchar_t* name, const _tovUID& vendorID, const wchar_t* vendorName,
                                           unsigned int componentCount, unsigned int flags) {
    return TOVGuarded([&] {
        if (!name || !vendorName) return TOV_E_INVALIDARG;
        m_PluginID = pluginID;
        m_Major = major;
        m_Minor = minor;
        m_Name = name;
        m_VendorID = vendorID;
        m_VendorName = vendorName;
        m_ComponentCount = componentCount;
        m_Flags = flags;
        return TOV_OK;
    });
}

TOVRESULT HostPluginDefinition::GetPluginID(_tovUID* out) {
    if (!out) return TOV_E_INVALIDARG;
    *out = m_PluginID;
    return TOV_OK;
}

TOVRESULT HostPluginDefinition::InternalQueryInterface(const _tovUID& iid, void** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        if (iid == IID_ITOVPluginDefinition || iid == IID_ITOVDefinition)
            return TOVExpose<ITOVPluginDefinition>(this, out);
        return CTOVUnknown::InternalQueryInterface(iid, out);
    });
}
