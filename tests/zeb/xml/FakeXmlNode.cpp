#include "FakeXmlNode.h"

#include "strings/ZEBString.h"
#include "tov/sdk/TOVFailureStyle.h"

FakeXmlNode::FakeXmlNode(int32_t type, std::string name, std::string value)
    : m_Type(type), m_Name(std::move(name)), m_Value(std::move(value)) {}

FakeXmlNode* FakeXmlNode::Add(FakeXmlNode* child) {
    m_Children.push_back(child);
    return this;
}

FakeXmlNode* FakeXmlNode::With(FakeXmlNode* attribute) {
    m_Attributes.push_back(attribute);
    return this;
}

TOVRESULT FakeXmlNode::QueryInterface(const _tovUID& iid, void** out) {
    *out = nullptr;
    if (queryResult < 0) return queryResult;
    const bool view = iid == UTIL::IID_ITOVXmlDomElement || iid == UTIL::IID_ITOVXmlDomAttribute;
    if (view && nullView) return TOV_OK;
    if (iid == UTIL::IID_ITOVXmlDomNode || iid == IID_ITOVUnknown) {
        *out = Dom();
    } else if (iid == UTIL::IID_ITOVXmlDomElement && m_Type == UTIL::kTOVXmlElement) {
        *out = static_cast<UTIL::ITOVXmlDomElement*>(this);
    } else if (iid == UTIL::IID_ITOVXmlDomAttribute && m_Type == UTIL::kTOVXmlAttribute) {
        *out = static_cast<UTIL::ITOVXmlDomAttribute*>(this);
    } else {
        return TOV_E_NOINTERFACE;
    }
    AddRef();
    return TOV_OK;
}

TOVRESULT FakeXmlNode::Text(const std::string& text, ITOVString** out) {
    *out = nullptr;
    return TOVGuarded([&] {
        ZEB::ZEBString::CreateString(out);
        return (*out)->Assign(kTOVUnicodeUTF8, reinterpret_cast<const unsigned char*>(text.c_str()),
                              static_cast<unsigned int>(text.size() + 1));
    });
}

TOVRESULT FakeXmlNode::HandOut(FakeXmlNode* node, UTIL::ITOVXmlDomNode** out) {
    *out = node->Dom();
    node->AddRef();
    return TOV_OK;
}

TOVRESULT FakeXmlNode::GetChild(uint32_t index, UTIL::ITOVXmlDomNode** out) {
    ++fetches;
    *out = nullptr;
    if (nullChild) return TOV_OK;
    return index < m_Children.size() ? HandOut(m_Children[index], out) : TOV_E_OUTOFRANGE;
}

TOVRESULT FakeXmlNode::GetAttributes(UTIL::ITOVXmlDomNodeList** out) {
    ++fetches;
    *out = nullptr;
    if (nullAttributeList) return TOV_OK;
    *out = this;
    AddRef();
    return TOV_OK;
}

TOVRESULT FakeXmlNode::GetItem(uint32_t index, UTIL::ITOVXmlDomNode** out) {
    *out = nullptr;
    return index < m_Attributes.size() ? HandOut(m_Attributes[index], out) : TOV_E_OUTOFRANGE;
}
