#include "tov/host/HostComponentDefinition.h"

#include "tov/sdk/TOVComponent.h"

TOVRESULT HostComponentDefinition::TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out) {
    return TOVCreateComponent<HostComponentDefinition>(host, outer, iid, out);
}

TOVRESULT HostComponentDefinition::Initialize(const _tovUID& compID, const _tovUID& compType, unsigned int major,
                                              unsigned int minor, const _tovUID& clsid, const wchar_t* name) {
    return TOVGuarded([&] {
        if (!name) return TOV_E_INVALIDARG;
        m_CompID = compID;
        m_CompType = compType;
        m_Major = major;
        m_Minor = minor;
        m_ClassID = clsid;
        m_Name = name;
        // Library start-up finds a component's class through this attribute.
        return m_Attributes.Set(TOVATTR_Component_CLSID, TOVTypeID_UID, &clsid, sizeof clsid);
    });
}

TOVRESULT HostComponentDefinition::GetComponentID(_tovUID* out) {
    if (!out) return TOV_E_INVALIDARG;
    *out = m_CompID;
    return TOV_OK;
}

TOVRESULT HostComponentDefinition::GetClassID(_tovUID* out) {
    if (!out) return TOV_E_INVALIDARG;
    *out = m_ClassID;
    return TOV_OK;
}

TOVRESULT HostComponentDefinition::InternalQueryInterface(const _tovUID& iid, void** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        if (iid == IID_ITOVComponentDefinition || iid == IID_ITOVDefinition)
            return TOVExpose<ITOVComponentDefinition>(this, out);
        return CTOVUnknown::InternalQueryInterface(iid, out);
    });
}
