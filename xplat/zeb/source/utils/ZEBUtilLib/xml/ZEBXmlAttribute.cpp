#include "xml/ZEBXmlAttribute.h"

#include "tov/sdk/TOVFailureStyle.h"
#include "tov/sdk/TOVPtr.h"
#include "xml/ZEBXmlElement.h"

namespace ZEB {
namespace XMLUtils {

namespace {

[[noreturn]] void Throw(TOVRESULT result) { throw static_cast<int>(result); }

}  // namespace

ZEBXmlAttribute::ZEBXmlAttribute() = default;

ZEBXmlAttribute::ZEBXmlAttribute(const ZEBString& name) { CopyStored(m_Name, name); }

ZEBXmlAttribute::ZEBXmlAttribute(const ZEBString& name, const ZEBString& value) {
    CopyStored(m_Name, name);
    CopyStored(m_Value, value);
}

ZEBXmlAttribute::ZEBXmlAttribute(ZEBXmlNode* owner) : ZEBXmlNode(owner) {}

ZEBXmlAttribute::ZEBXmlAttribute(UTIL::ITOVXmlDomNode* dom) : ZEBXmlNode(dom) {}

ZEBXmlAttribute::ZEBXmlAttribute(const ZEBXmlAttribute& other) : ZEBXmlNode() { TOVCheck(other.CopyTo(*this)); }

ZEBXmlAttribute& ZEBXmlAttribute::operator=(const ZEBXmlAttribute& other) {
    ZEBXmlNode::operator=(other);
    return *this;
}

TOVRESULT ZEBXmlAttribute::CopyTo(ZEBXmlNode& target) const {
    return TOVGuarded([&] {
        auto& copy = dynamic_cast<ZEBXmlAttribute&>(target);
        TOVCheck(ZEBXmlNode::CopyTo(copy));
        CopyStored(copy.m_Name, m_Name);
        CopyStored(copy.m_Value, m_Value);
        return TOV_OK;
    });
}

TOVRESULT ZEBXmlAttribute::Save(UTIL::ITOVXmlWriter* writer) {
    return TOVGuarded([&] {
        if (!writer) Throw(TOV_E_INVALIDARG);
        const ZEBString tag = OwningElement().GetTagName();
        const ZEBString name = GetName();
        const ZEBString value = GetValue();
        TOVCheck(writer->WriteAttribute(name.InArg(), value.InArg(), tag.InArg()));
        return TOV_OK;
    });
}

ZEBString ZEBXmlAttribute::GetName() const {
    if (m_Status == kStatusDeleted) Throw(ZEB_E_NOTFOUND);
    if (HoldsOwnText()) return StoredText(m_Name);
    return FromDom(&UTIL::ITOVXmlDomAttribute::GetAttributeName);
}

ZEBString ZEBXmlAttribute::GetValue() const {
    if (m_Status == kStatusDeleted) Throw(ZEB_E_NOTFOUND);
    if (HoldsOwnText()) return StoredText(m_Value);
    return FromDom(&UTIL::ITOVXmlDomAttribute::GetAttributeValue);
}

ZEBString ZEBXmlAttribute::FromDom(TOVRESULT (UTIL::ITOVXmlDomAttribute::*get)(ITOVString**)) const {
    if (!m_pDom) Throw(ZEB_E_NOTREADY);
    TOVPtr<UTIL::ITOVXmlDomAttribute> view;
    TOVCheck(m_pDom->QueryInterface(UTIL::IID_ITOVXmlDomAttribute, view.Out()));
    ITOVString* text = nullptr;
    TOVCheck(((*view).*get)(&text));
    return Adopt(text);
}

TOVRESULT ZEBXmlAttribute::SetName(const ZEBString& name) {
    return TOVGuarded([&] {
        if (!IsNew()) Throw(TOV_E_UNEXPECTED);
        auto* owner = NodeAs<ZEBXmlElement>(m_pOwner);
        if (owner && owner->HasAttribute(name)) Throw(TOV_E_INVALIDARG);
        CopyStored(m_Name, name);
        if (owner) owner->RefreshAttributeIndex();
        return TOV_OK;
    });
}

TOVRESULT ZEBXmlAttribute::SetValue(const ZEBString& value) {
    return TOVGuarded([&] {
        // Once changed, the attribute answers its name from what it stores,
        // so a bound one keeps the DOM's name there first.
        if (!HoldsOwnText()) m_Name = FromDom(&UTIL::ITOVXmlDomAttribute::GetAttributeName);
        CopyStored(m_Value, value);
        OnChanged();
        return TOV_OK;
    });
}

}  // namespace XMLUtils
}  // namespace ZEB
