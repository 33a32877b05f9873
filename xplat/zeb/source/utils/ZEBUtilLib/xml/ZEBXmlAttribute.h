#pragma once
/// An attribute of the lazy XML tree. A bound attribute answers from the DOM
/// until it is changed; one made in memory or changed answers from its own
/// name and value.
#include "xml/ZEBXmlNode.h"

namespace ZEB {
namespace XMLUtils {

class ZEBXmlAttribute : public ZEBXmlNode {
public:
    static constexpr int32_t kNodeKind = 2;
    int32_t NodeKind() const override { return kNodeKind; }
    /// Attributes made in memory, status new.
    ZEBXmlAttribute();
    explicit ZEBXmlAttribute(const ZEBString& name);
    ZEBXmlAttribute(const ZEBString& name, const ZEBString& value);
    explicit ZEBXmlAttribute(ZEBXmlNode* owner);
    explicit ZEBXmlAttribute(UTIL::ITOVXmlDomNode* dom);
    /// A copy by CopyTo; a failure is thrown.
    ZEBXmlAttribute(const ZEBXmlAttribute& other);
    ZEBXmlAttribute& operator=(const ZEBXmlAttribute& other);
    using ZEBXmlNode::operator=;

    /// The target must be an attribute; name and value are copied too.
    TOVRESULT CopyTo(ZEBXmlNode& target) const override;
    /// Writes name and value on the owning element's tag. A deleted attribute
    /// cannot be saved: its name is gone (ZEB_E_NOTFOUND).
    TOVRESULT Save(UTIL::ITOVXmlWriter* writer) override;
    /// ZEB_E_NOTFOUND for a deleted attribute.
    ZEBString GetName() const override;
    ZEBString GetValue() const override;

    /// For an attribute made in memory only (TOV_E_UNEXPECTED otherwise); a
    /// name that the owning element already has is TOV_E_INVALIDARG.
    TOVRESULT SetName(const ZEBString& name);
    /// Sets the value and marks the attribute changed.
    TOVRESULT SetValue(const ZEBString& value);

private:
    /// What the DOM's attribute view answers through `get`.
    ZEBString FromDom(TOVRESULT (UTIL::ITOVXmlDomAttribute::*get)(ITOVString**)) const;

    ZEBString m_Name;
    ZEBString m_Value;
};

}  // namespace XMLUtils
}  // namespace ZEB
