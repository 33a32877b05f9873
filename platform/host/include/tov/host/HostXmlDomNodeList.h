#pragma once
/// A list of nodes of one parsed document.
#include <vector>

#include "tov/host/HostXmlNodeBase.h"

class HostXmlDomNodeList : public UTIL::ITOVXmlDomNodeList, public CTOVUnknown {
public:
    /// `*out` owns one reference.
    static TOVRESULT Create(const HostXmlDocumentRef& document, std::vector<xmlNodePtr> nodes,
                            UTIL::ITOVXmlDomNodeList** out);
    explicit HostXmlDomNodeList(ITOVUnknown* outer) : CTOVUnknown(outer) {}

    TOV_FORWARD_UNKNOWN
    uint32_t GetCount() override { return static_cast<uint32_t>(m_Nodes.size()); }
    TOVRESULT GetItem(uint32_t index, UTIL::ITOVXmlDomNode** out) override;
    TOVRESULT InternalQueryInterface(const _tovUID& iid, void** out) override;

private:
    HostXmlDocumentRef m_Document;
    std::vector<xmlNodePtr> m_Nodes;
};
