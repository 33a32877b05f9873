#include "xml/ZEBXmlText.h"

#include "tov/sdk/TOVFailureStyle.h"
#include "xml/ZEBXmlElement.h"

namespace ZEB {
namespace XMLUtils {

ZEBXmlText::ZEBXmlText() = default;

ZEBXmlText::ZEBXmlText(const ZEBString& text) { CopyStored(m_Text, text); }

ZEBXmlText::ZEBXmlText(ZEBXmlNode* owner) : ZEBXmlNode(owner) {}

ZEBXmlText::ZEBXmlText(UTIL::ITOVXmlDomNode* dom) : ZEBXmlNode(dom) {}

ZEBXmlText::ZEBXmlText(const ZEBXmlText& other) : ZEBXmlNode() { TOVCheck(other.CopyTo(*this)); }

ZEBXmlText& ZEBXmlText::operator=(const ZEBXmlText& other) {
    ZEBXmlNode::operator=(other);
    return *this;
}

TOVRESULT ZEBXmlText::CopyTo(ZEBXmlNode& target) const {
    return TOVGuarded([&] {
        auto& copy = dynamic_cast<ZEBXmlText&>(target);
        TOVCheck(ZEBXmlNode::CopyTo(copy));
        CopyStored(copy.m_Text, m_Text);
        return TOV_OK;
    });
}

TOVRESULT ZEBXmlText::Save(UTIL::ITOVXmlWriter* writer) {
    return TOVGuarded([&] {
        if (!writer) throw static_cast<int>(TOV_E_INVALIDARG);
        const ZEBString tag = OwningElement().GetTagName();
        const ZEBString text = GetText();
        TOVCheck(writer->WriteText(text.InArg(), tag.InArg()));
        return TOV_OK;
    });
}

ZEBString ZEBXmlText::GetText() const {
    if (m_Status == kStatusDeleted) return EmptyText();
    if (HoldsOwnText()) return StoredText(m_Text);
    return GetValue();
}

TOVRESULT ZEBXmlText::SetText(const ZEBString& text) {
    return TOVGuarded([&] {
        CopyStored(m_Text, text);
        OnChanged();
        return TOV_OK;
    });
}

}  // namespace XMLUtils
}  // namespace ZEB
