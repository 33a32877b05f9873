#pragma once
/// A DOM view of an attribute.
#include "tov/host/HostXmlNodeBase.h"

class HostXmlDomAttribute : public HostXmlNodeBase<UTIL::ITOVXmlDomAttribute, UTIL::IID_ITOVXmlDomAttribute> {
public:
    explicit HostXmlDomAttribute(ITOVUnknown* outer) : HostXmlNodeBase(outer) {}
    TOVRESULT GetAttributeName(ITOVString** out) override { return this->GetName(out); }
    TOVRESULT GetAttributeValue(ITOVString** out) override { return this->GetValue(out); }
};
