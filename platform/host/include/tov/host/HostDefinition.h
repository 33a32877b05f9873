#pragma once
/// The attribute slots that every definition component of the host shares.
#include "tov/host/DefinitionAttributes.h"
#include "tov/sdk/CTOVUnknown.h"
#include "tov/sdk/TOVFailureStyle.h"

/// `Interface` derives from ITOVDefinition.
template <class Interface>
class HostDefinition : public Interface, public CTOVUnknown {
public:
    explicit HostDefinition(ITOVUnknown* outer) : CTOVUnknown(outer) {}

    TOV_FORWARD_UNKNOWN
    TOVRESULT GetAttribute(const _tovUID& attribute, const _tovUID& type, void* out, unsigned int size) override {
        return TOVGuarded([&] { return m_Attributes.Get(attribute, type, out, size); });
    }
    TOVRESULT SetAttribute(const _tovUID& attribute, const _tovUID& type, const void* value, int size) override {
        return TOVGuarded([&] { return m_Attributes.Set(attribute, type, value, size); });
    }

protected:
    DefinitionAttributes m_Attributes;
};
