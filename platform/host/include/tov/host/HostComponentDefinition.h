#pragma once
/// The host's component definition component (TOVCompID_ComponentDefinition).
#include <string>

#include "tov/ITOVComponentDefinition.h"
#include "tov/host/HostDefinition.h"

inline constexpr _tovUID CLSID_HostComponentDefinition = {
    0x00905627, 0x6EBA, 0x4AD8, {0xA7, 0xD7, 0x82, 0x6D, 0x2C, 0x2B, 0xD4, 0xB5}};

class HostComponentDefinition : public HostDefinition<ITOVComponentDefinition> {
public:
    static TOVRESULT TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out);
    explicit HostComponentDefinition(ITOVUnknown* outer) : HostDefinition(outer) {}

    TOVRESULT Initialize(const _tovUID& compID, const _tovUID& compType, unsigned int major, unsigned int minor,
                         const _tovUID& clsid, const wchar_t* name) override;
    TOVRESULT GetComponentID(_tovUID* out) override;
    TOVRESULT GetClassID(_tovUID* out) override;
    const wchar_t* GetName() override { return m_Name.c_str(); }

    TOVRESULT InternalQueryInterface(const _tovUID& iid, void** out) override;

    const _tovUID& GetComponentType() const { return m_CompType; }

private:
    _tovUID m_CompID{};
    _tovUID m_CompType{};
    _tovUID m_ClassID{};
    std::wstring m_Name;
    unsigned int m_Major = 0;
    unsigned int m_Minor = 0;
};
