#pragma once
/// The host's component definition component (TOVCompID_ComponentDefinition).
#include <string>

#include "tov/ITOVComponentDefinition.h"
#include "tov/host/DefinitionAttributes.h"
#include "tov/sdk/CTOVUnknown.h"

inline constexpr _tovUID CLSID_HostComponentDefinition = {0x00905627, 0x6EBA, 0x4AD8, {0xA7, 0xD7, 0x82, 0x6D, 0x2C, 0x2B, 0xD4, 0xB5}};

class HostComponentDefinition : public ITOVComponentDefinition, public CTOVUnknown {
public:
    static TOVRESULT TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out);
    explicit HostComponentDefinition(ITOVUnknown* outer) : CTOVUnknown(outer) {}

    TOV_FORWARD_UNKNOWN
    TOVRESULT GetAttribute(const _tovUID& attribute, const _tovUID& type, void* out, unsigned int size) override;
    TOVRESULT SetAttribute(const _tovUID& attribute, const _tovUID& type, const void* value, int size) override;
    TOVRESULT Initialize(const _tovUID& compID, const _tovUID& compType, unsigned int major, unsigned int minor,
                         const _tovUID& clsid, const wchar_t* name) override;
    TOVRESULT GetComponentID(_tovUID* out) override;
    TOVRESULT GetClassID(_tovUID* out) override;
    const wchar_t* GetName() override { return m_Name.c_str(); }

    TOVRESULT InternalQueryInterface(const _tovUID& iid, void** out) override;

    const _tovUID& GetComponentType() const { return m_CompType; }

private:
    DefinitionAttributes m_Attributes;
    _tovUID m_CompID{};
    _tovUID m_CompType{};
    _tovUID m_ClassID{};
    std::wstring m_Name;
    unsigned int m_Major = 0;
    unsigned int m_Minor = 0;
};
