#pragma once
/// The host's plug-in definition component (TOVCompID_PluginDefinition).
#include <string>

#include "tov/ITOVPluginDefinition.h"
#include "tov/host/HostDefinition.h"

inline constexpr _tovUID CLSID_HostPluginDefinition = {
    0xBA8ECAE5, 0xE1C4, 0x4FCF, {0x98, 0xCF, 0x17, 0xE1, 0x92, 0x77, 0x4A, 0x8D}};

class HostPluginDefinition : public HostDefinition<ITOVPluginDefinition> {
public:
    static TOVRESULT TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out);
    explicit HostPluginDefinition(ITOVUnknown* outer) : HostDefinition(outer) {}

    TOVRESULT Initialize(const _tovUID& pluginID, unsigned int major, unsigned int minor, const wchar_t* name,
                         const _tovUID& vendorID, const wchar_t* vendorName, unsigned int componentCount,
                         unsigned int flags) override;
    TOVRESULT GetPluginID(_tovUID* out) override;
    const wchar_t* GetName() override { return m_Name.c_str(); }
    unsigned int GetComponentCount() override { return m_ComponentCount; }

    TOVRESULT InternalQueryInterface(const _tovUID& iid, void** out) override;

    const std::wstring& GetVendorName() const { return m_VendorName; }
    unsigned int GetMajor() const { return m_Major; }
    unsigned int GetMinor() const { return m_Minor; }

private:
    _tovUID m_PluginID{};
    _tovUID m_VendorID{};
    std::wstring m_Name;
    std::wstring m_VendorName;
    unsigned int m_Major = 0;
    unsigned int m_Minor = 0;
    unsigned int m_ComponentCount = 0;
    unsigned int m_Flags = 0;
};
