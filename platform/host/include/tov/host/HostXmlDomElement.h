#pragma once
/// A DOM view of an element.
#include "tov/host/HostXmlNodeBase.h"

class HostXmlDomElement : public HostXmlNodeBase<UTIL::ITOVXmlDomElement, UTIL::IID_ITOVXmlDomElement> {
public:
    explicit HostXmlDomElement(ITOVUnknown* outer) : HostXmlNodeBase(outer) {}
    TOVRESULT GetTagName(ITOVString** out) override { return this->GetName(out); }
};
