#pragma once
/// The node operations shared by the host's DOM views over a libxml2 tree.
/// Each view keeps the document alive through a shared owner.
#include <libxml/tree.h>

#include <memory>

#include "tov/ITOVXmlDom.h"
#include "tov/sdk/CTOVUnknown.h"

/// Owns a parsed document; every node view holds one.
using HostXmlDocumentRef = std::shared_ptr<xmlDoc>;

namespace HostXmlNodes {
/// A new view of `node` (element, attribute or other) answering
/// ITOVXmlDomNode; `*out` owns one reference.
TOVRESULT Wrap(const HostXmlDocumentRef& document, xmlNodePtr node, UTIL::ITOVXmlDomNode** out);
}  // namespace HostXmlNodes

/// `Interface` is ITOVXmlDomNode or one of its views, `ViewIID` its identifier;
/// a view answers for the node as well.
template <class Interface, const _tovUID& ViewIID>
class HostXmlNodeBase : public Interface, public CTOVUnknown {
public:
    explicit HostXmlNodeBase(ITOVUnknown* outer) : CTOVUnknown(outer) {}

    TOV_FORWARD_UNKNOWN
    /// Set once, right after creation.
    void Attach(HostXmlDocumentRef document, xmlNodePtr node) {
        m_Document = std::move(document);
        m_Node = node;
    }

    int HasAttributes() override { return m_Node->type == XML_ELEMENT_NODE && m_Node->properties ? 1 : 0; }
    int32_t GetNodeType() override { return static_cast<int32_t>(m_Node->type); }
    TOVRESULT GetName(ITOVString** out) override;
    TOVRESULT GetValue(ITOVString** out) override;
    uint32_t GetChildCount() override;
    TOVRESULT GetChild(uint32_t index, UTIL::ITOVXmlDomNode** out) override;
    TOVRESULT GetAttributes(UTIL::ITOVXmlDomNodeList** out) override;
    TOVRESULT InternalQueryInterface(const _tovUID& iid, void** out) override;

protected:
    xmlNodePtr m_Node = nullptr;
    HostXmlDocumentRef m_Document;

private:
    /// The first child in libxml2's linked list of them, or null.
    xmlNodePtr FirstChild() const;

    /// The child last handed out and its index: children are mostly asked
    /// for in order, and a parsed tree never changes, so each is found from
    /// the one before.
    xmlNodePtr m_Cursor = nullptr;
    uint32_t m_CursorIndex = 0;
};
