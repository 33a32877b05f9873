#include "tov/host/HostXmlDomNodeList.h"

#include "tov/sdk/TOVComponent.h"
#include "tov/sdk/TOVPtr.h"

TOVRESULT HostXmlDomNodeList::Create(const HostXmlDocumentRef& document, std::vector<xmlNodePtr> nodes,
                                     UTIL::ITOVXmlDomNodeList** out) {
    return TOVGuarded([&] {
        TOVPtr<UTIL::ITOVXmlDomNodeList> list;
        TOVCheck(TOVCreateComponent<HostXmlDomNodeList>(nullptr, nullptr, UTIL::IID_ITOVXmlDomNodeList, list.Out()));
        auto* self = static_cast<HostXmlDomNodeList*>(list.Get());
        self->m_Document = document;
        self->m_Nodes = std::move(nodes);
        *out = list.Detach();
        return TOV_OK;
    });
}

TOVRESULT HostXmlDomNodeList::GetItem(uint32_t index, UTIL::ITOVXmlDomNode** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        *out = nullptr;
        if (index >= m_Nodes.size()) return TOV_E_OUTOFRANGE;
        return HostXmlNodes::Wrap(m_Document, m_Nodes[index], out);
    });
}

TOVRESULT HostXmlDomNodeList::InternalQueryInterface(const _tovUID& iid, void** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        if (iid == UTIL::IID_ITOVXmlDomNodeList) return TOVExpose<UTIL::ITOVXmlDomNodeList>(this, out);
        return CTOVUnknown::InternalQueryInterface(iid, out);
    });
}
