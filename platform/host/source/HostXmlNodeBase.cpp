#include "tov/host/HostXmlNodeBase.h"

#include <string>
#include <string_view>
#include <vector>

#include "tov/host/CreateKnownComponent.h"
#include "tov/host/HostText.h"
#include "tov/host/HostXmlDomAttribute.h"
#include "tov/host/HostXmlDomElement.h"
#include "tov/host/HostXmlDomNode.h"
#include "tov/host/HostXmlDomNodeList.h"
#include "tov/sdk/TOVComponent.h"
#include "tov/sdk/TOVPtr.h"

namespace {

// Names and texts are read where libxml2 keeps them; `storage` holds the few
// that must be put together or freed first.
std::string_view Text(const xmlChar* text) { return text ? reinterpret_cast<const char*>(text) : ""; }

std::string_view QualifiedName(xmlNodePtr node, std::string& storage) {
    if (!node->ns || !node->ns->prefix) return Text(node->name);
    storage = std::string(Text(node->ns->prefix)) + ":" + std::string(Text(node->name));
    return storage;
}

std::string_view NodeName(xmlNodePtr node, std::string& storage) {
    switch (node->type) {
        case XML_ELEMENT_NODE:
        case XML_ATTRIBUTE_NODE:
            return QualifiedName(node, storage);
        case XML_TEXT_NODE:
            return "#text";
        case XML_CDATA_SECTION_NODE:
            return "#cdata-section";
        case XML_COMMENT_NODE:
            return "#comment";
        default:
            return Text(node->name);
    }
}

std::string_view NodeValue(xmlDocPtr document, xmlNodePtr node, std::string& storage) {
    if (node->type == XML_ATTRIBUTE_NODE) {
        xmlChar* value = xmlNodeListGetString(document, node->children, 1);
        storage = Text(value);
        xmlFree(value);
        return storage;
    }
    if (node->type == XML_ELEMENT_NODE) return "";
    return Text(node->content);
}

template <class View>
TOVRESULT MakeView(const HostXmlDocumentRef& document, xmlNodePtr node, UTIL::ITOVXmlDomNode** out) {
    TOVPtr<UTIL::ITOVXmlDomNode> view;
    TOVCheck((CreateKnownComponent<UTIL::ITOVXmlDomNode, View>(view.OutT())));
    static_cast<View*>(view.Get())->Attach(document, node);
    *out = view.Detach();
    return TOV_OK;
}

}  // namespace

namespace HostXmlNodes {

TOVRESULT Wrap(const HostXmlDocumentRef& document, xmlNodePtr node, UTIL::ITOVXmlDomNode** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        *out = nullptr;
        if (!node) return TOV_E_POINTER;
        if (node->type == XML_ELEMENT_NODE) return MakeView<HostXmlDomElement>(document, node, out);
        if (node->type == XML_ATTRIBUTE_NODE) return MakeView<HostXmlDomAttribute>(document, node, out);
        return MakeView<HostXmlDomNode>(document, node, out);
    });
}

}  // namespace HostXmlNodes

template <class Interface, const _tovUID& ViewIID>
TOVRESULT HostXmlNodeBase<Interface, ViewIID>::GetName(ITOVString** out) {
    return TOVGuarded([&] {
        std::string storage;
        return HostText::Make(NodeName(m_Node, storage), out);
    });
}

template <class Interface, const _tovUID& ViewIID>
TOVRESULT HostXmlNodeBase<Interface, ViewIID>::GetValue(ITOVString** out) {
    return TOVGuarded([&] {
        std::string storage;
        return HostText::Make(NodeValue(m_Document.get(), m_Node, storage), out);
    });
}

template <class Interface, const _tovUID& ViewIID>
xmlNodePtr HostXmlNodeBase<Interface, ViewIID>::FirstChild() const {
    // Attributes are not children, and an attribute's own children are its value.
    return m_Node->type == XML_ATTRIBUTE_NODE ? nullptr : m_Node->children;
}

template <class Interface, const _tovUID& ViewIID>
uint32_t HostXmlNodeBase<Interface, ViewIID>::GetChildCount() {
    uint32_t count = 0;
    for (xmlNodePtr child = FirstChild(); child; child = child->next) ++count;
    return count;
}

template <class Interface, const _tovUID& ViewIID>
TOVRESULT HostXmlNodeBase<Interface, ViewIID>::GetChild(uint32_t index, UTIL::ITOVXmlDomNode** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        *out = nullptr;
        if (!m_Cursor || index < m_CursorIndex) {
            m_Cursor = FirstChild();
            m_CursorIndex = 0;
        }
        for (; m_Cursor && m_CursorIndex < index; ++m_CursorIndex) m_Cursor = m_Cursor->next;
        if (!m_Cursor) return TOV_E_OUTOFRANGE;
        return HostXmlNodes::Wrap(m_Document, m_Cursor, out);
    });
}

template <class Interface, const _tovUID& ViewIID>
TOVRESULT HostXmlNodeBase<Interface, ViewIID>::GetAttributes(UTIL::ITOVXmlDomNodeList** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        std::vector<xmlNodePtr> attributes;
        if (m_Node->type == XML_ELEMENT_NODE)
            for (xmlAttrPtr a = m_Node->properties; a; a = a->next)
                attributes.push_back(reinterpret_cast<xmlNodePtr>(a));
        return HostXmlDomNodeList::Create(m_Document, std::move(attributes), out);
    });
}

template <class Interface, const _tovUID& ViewIID>
TOVRESULT HostXmlNodeBase<Interface, ViewIID>::InternalQueryInterface(const _tovUID& iid, void** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        if (iid == UTIL::IID_ITOVXmlDomNode || iid == ViewIID) return TOVExpose<Interface>(this, out);
        return CTOVUnknown::InternalQueryInterface(iid, out);
    });
}

template class HostXmlNodeBase<UTIL::ITOVXmlDomNode, UTIL::IID_ITOVXmlDomNode>;
template class HostXmlNodeBase<UTIL::ITOVXmlDomElement, UTIL::IID_ITOVXmlDomElement>;
template class HostXmlNodeBase<UTIL::ITOVXmlDomAttribute, UTIL::IID_ITOVXmlDomAttribute>;
