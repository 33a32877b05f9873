#include "xml/ZEBXmlNode.h"

#include <algorithm>
#include <memory>

#include "tov/sdk/TOVFailureStyle.h"
#include "tov/sdk/TOVPtr.h"
#include "xml/ZEBXmlAttribute.h"
#include "xml/ZEBXmlCDATA.h"
#include "xml/ZEBXmlElement.h"
#include "xml/ZEBXmlText.h"

namespace ZEB {
namespace XMLUtils {

namespace {

[[noreturn]] void Throw(TOVRESULT result) { throw static_cast<int>(result); }

}  // namespace

ZEBXmlNode::ZEBXmlNode() : ZEBXmlNode(static_cast<ZEBXmlNode*>(nullptr)) {}

ZEBXmlNode::ZEBXmlNode(ZEBXmlNode* owner)
    : m_pDom(nullptr), m_Origin(kOriginNew), m_Status(kStatusNew), m_pOwner(owner) {}

ZEBXmlNode::ZEBXmlNode(UTIL::ITOVXmlDomNode* dom)
    : m_pDom(dom), m_Origin(kOriginBound), m_Status(kStatusNotLoaded), m_pOwner(nullptr) {
    if (m_pDom) m_pDom->AddRef();
}

ZEBXmlNode::~ZEBXmlNode() {
    if (m_pDom) m_pDom->Release();
    DeleteChildren();
}

void ZEBXmlNode::DeleteChildren() {
    // Emptied before deleting, so that nothing reaches a child half gone.
    std::vector<ZEBXmlNode*> children;
    children.swap(m_Children);
    for (ZEBXmlNode* child : children) delete child;
}

TOVRESULT ZEBXmlNode::Load() {
    return TOVGuarded([&] {
        if (m_Status != kStatusNotLoaded) return TOV_OK;
        if (!m_pDom) Throw(ZEB_E_NOTREADY);
        DeleteChildren();
        if (m_pDom->HasAttributes()) {
            TOVPtr<UTIL::ITOVXmlDomNodeList> attributes;
            TOVCheck(m_pDom->GetAttributes(attributes.OutT()));
            const uint32_t count = attributes->GetCount();
            for (uint32_t i = 0; i < count; ++i) {
                TOVPtr<UTIL::ITOVXmlDomNode> item;
                TOVCheck(attributes->GetItem(i, item.OutT()));
                AddBoundChild(item.Get());
            }
        }
        const uint32_t count = m_pDom->GetChildCount();
        m_Children.reserve(m_Children.size() + count);
        for (uint32_t i = 0; i < count; ++i) {
            TOVPtr<UTIL::ITOVXmlDomNode> child;
            TOVCheck(m_pDom->GetChild(i, child.OutT()));
            AddBoundChild(child.Get());
        }
        m_Status = kStatusLoaded;
        return TOV_OK;
    });
}

void ZEBXmlNode::AddBoundChild(UTIL::ITOVXmlDomNode* dom) {
    if (!dom) Throw(TOV_E_POINTER);
    std::unique_ptr<ZEBXmlNode> wrapper(Bind(dom));
    if (!wrapper) return;
    wrapper->m_pOwner = this;
    m_Children.push_back(wrapper.get());
    wrapper.release();
}

void ZEBXmlNode::OnChanged() { m_Status = kStatusChanged; }

TOVRESULT ZEBXmlNode::CopyTo(ZEBXmlNode& target) const {
    return TOVGuarded([&] {
        // Clearing the target first would destroy the source of a self-copy.
        if (&target == this) return TOV_OK;
        target.Clear();
        target.m_pDom = m_pDom;
        if (m_pDom) m_pDom->AddRef();
        target.DomChanged();
        target.m_pOwner = m_pOwner;
        target.m_Origin = m_Origin;
        target.m_Status = m_Status;
        for (const ZEBXmlNode* child : m_Children) {
            if (!child->m_pDom) Throw(ZEB_E_NOTREADY);
            std::unique_ptr<ZEBXmlNode> copy(CreateNew(child->m_pDom));
            if (!copy) Throw(TOV_E_UNEXPECTED);
            TOVCheck(child->CopyTo(*copy));
            copy->m_pOwner = &target;
            target.m_Children.push_back(copy.get());
            copy.release();
        }
        return TOV_OK;
    });
}

void ZEBXmlNode::Clear() {
    if (m_pDom) {
        m_pDom->Release();
        m_pDom = nullptr;
        DomChanged();
    }
    m_Status = kStatusNotLoaded;
    DeleteChildren();
}

TOVRESULT ZEBXmlNode::Delete() {
    m_Status = kStatusDeleted;
    return TOV_OK;
}

ZEBXmlNode* ZEBXmlNode::Append(UTIL::ITOVXmlDomNode* dom) {
    if (!dom || m_Status == kStatusDeleted) return nullptr;
    TOVCheck(Load());
    if (ZEBXmlNode* existing = ChildHolding(dom, false)) return existing;
    std::unique_ptr<ZEBXmlNode> wrapper(Bind(dom));
    if (!wrapper || Append(wrapper.get()) < 0) return nullptr;
    return wrapper.release();
}

TOVRESULT ZEBXmlNode::Append(ZEBXmlNode* node) {
    return TOVGuarded([&] {
        if (!node) Throw(TOV_E_INVALIDARG);
        if (!node->IsNew()) {
            if (!node->m_pDom) Throw(ZEB_E_NOTREADY);
            TOVCheck(Load());
            if (ChildHolding(node->m_pDom, true)) Throw(TOV_E_UNEXPECTED);
        }
        ZEBXmlNode* const formerOwner = node->m_pOwner;
        node->m_pOwner = this;
        m_Children.push_back(node);
        try {
            OnChanged();
        } catch (...) {
            m_Children.pop_back();
            node->m_pOwner = formerOwner;
            throw;
        }
        return TOV_OK;
    });
}

TOVRESULT ZEBXmlNode::Remove(UTIL::ITOVXmlDomNode* dom) {
    return TOVGuarded([&] {
        if (!dom) Throw(TOV_E_INVALIDARG);
        TOVCheck(Load());
        ZEBXmlNode* child = ChildHolding(dom, false);
        if (!child) Throw(ZEB_E_NOTFOUND);
        TOVCheck(Remove(child));
        delete child;
        return TOV_OK;
    });
}

TOVRESULT ZEBXmlNode::Remove(ZEBXmlNode* node) {
    return TOVGuarded([&] {
        if (!node) Throw(TOV_E_INVALIDARG);
        TOVCheck(Load());
        const auto found = std::find(m_Children.begin(), m_Children.end(), node);
        if (found == m_Children.end()) return TOV_OK;
        m_Children.erase(found);
        node->m_pOwner = nullptr;
        OnChanged();
        return TOV_OK;
    });
}

TOVRESULT ZEBXmlNode::Reload() {
    return TOVGuarded([&] {
        if (m_Status == kStatusLoaded) return TOV_OK;
        if (m_Status == kStatusNotLoaded) return Load();
        m_Status = kStatusNotLoaded;
        return Load();
    });
}

TOVRESULT ZEBXmlNode::DiscardChanges() {
    return TOVGuarded([&] {
        TOVCheck(Load());
        std::vector<ZEBXmlNode*> kept;
        for (ZEBXmlNode* child : m_Children) {
            if (child->IsNew()) {
                // Out of the tree nothing would own it any more.
                delete child;
            } else {
                kept.push_back(child);
            }
        }
        m_Children.swap(kept);
        for (ZEBXmlNode* child : m_Children) TOVCheck(child->DiscardChanges());
        m_Status = kStatusLoaded;
        return TOV_OK;
    });
}

ZEBString ZEBXmlNode::GetName() const {
    if (!m_pDom) Throw(ZEB_E_NOTREADY);
    ITOVString* name = nullptr;
    TOVCheck(m_pDom->GetName(&name));
    return Adopt(name);
}

ZEBString ZEBXmlNode::GetValue() const {
    if (!m_pDom) Throw(ZEB_E_NOTREADY);
    ITOVString* value = nullptr;
    TOVCheck(m_pDom->GetValue(&value));
    return Adopt(value);
}

ZEBXmlNode* ZEBXmlNode::CreateNew(UTIL::ITOVXmlDomNode* dom) {
    if (!dom) Throw(TOV_E_INVALIDARG);
    switch (dom->GetNodeType()) {
        case UTIL::kTOVXmlElement:
            return new ZEBXmlElement();
        case UTIL::kTOVXmlAttribute:
            return new ZEBXmlAttribute();
        case UTIL::kTOVXmlText:
            return new ZEBXmlText();
        case UTIL::kTOVXmlCDATA:
            return new ZEBXmlCDATA();
        default:
            return nullptr;
    }
}

ZEBXmlNode* ZEBXmlNode::Bind(UTIL::ITOVXmlDomNode* dom) {
    if (!dom) Throw(TOV_E_INVALIDARG);
    switch (dom->GetNodeType()) {
        case UTIL::kTOVXmlElement:
            return new ZEBXmlElement(dom);
        case UTIL::kTOVXmlAttribute:
            return new ZEBXmlAttribute(dom);
        case UTIL::kTOVXmlText:
            return new ZEBXmlText(dom);
        case UTIL::kTOVXmlCDATA:
            return new ZEBXmlCDATA(dom);
        default:
            return nullptr;
    }
}

UTIL::ITOVXmlDomNode* ZEBXmlNode::InArg() const {
    if (!m_pDom) Throw(ZEB_E_NOTREADY);
    return m_pDom;
}

UTIL::ITOVXmlDomNode** ZEBXmlNode::OutArg() {
    // Children of the former node would not belong to the new one.
    Clear();
    return &m_pDom;
}

ZEBXmlNode& ZEBXmlNode::operator=(UTIL::ITOVXmlDomNode* dom) {
    if (dom == m_pDom) return *this;
    Clear();
    m_pDom = dom;
    if (m_pDom) m_pDom->AddRef();
    DomChanged();
    m_Status = kStatusNotLoaded;
    return *this;
}

ZEBXmlNode& ZEBXmlNode::operator=(const ZEBXmlNode& other) {
    TOVCheck(other.CopyTo(*this));
    return *this;
}

int32_t ZEBXmlNode::GetType() const {
    if (!m_pDom) Throw(ZEB_E_NOTREADY);
    return m_pDom->GetNodeType();
}

ZEBXmlNode* ZEBXmlNode::Lookup(UTIL::ITOVXmlDomNode* dom) {
    if (!dom) return nullptr;
    TOVCheck(Load());
    return ChildHolding(dom, true);
}

ZEBXmlNode* ZEBXmlNode::ChildHolding(UTIL::ITOVXmlDomNode* dom, bool strict) const {
    for (ZEBXmlNode* child : m_Children) {
        if (!child->m_pDom) {
            if (strict) Throw(ZEB_E_NOTREADY);
            continue;
        }
        if (child->m_pDom == dom) return child;
    }
    return nullptr;
}

ZEBXmlElement& ZEBXmlNode::OwningElement() const {
    auto* element = NodeAs<ZEBXmlElement>(m_pOwner);
    if (!element) Throw(ZEB_E_NOTREADY);
    return *element;
}

ZEBString ZEBXmlNode::Adopt(ITOVString* fetched) {
    if (!fetched) return EmptyText();
    return ZEBString(fetched, 1);
}

ZEBString ZEBXmlNode::EmptyText() {
    static const unsigned short kNoText[] = {0};
    return ZEBString(kNoText);
}

ZEBString ZEBXmlNode::StoredText(const ZEBString& stored) {
    if (stored.IsEmpty()) return EmptyText();
    return ZEBString(stored);
}

void ZEBXmlNode::CopyStored(ZEBString& to, const ZEBString& from) {
    if (from.IsEmpty()) {
        to.Clear();
    } else {
        to = from;
    }
}

}  // namespace XMLUtils
}  // namespace ZEB
