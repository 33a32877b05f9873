#pragma once
/// A text node of the lazy XML tree. A bound node answers from the DOM until
/// it is changed; one made in memory or changed answers from its own text.
#include "xml/ZEBXmlNode.h"

namespace ZEB {
namespace XMLUtils {

class ZEBXmlText : public ZEBXmlNode {
public:
    static constexpr int32_t kNodeKind = 3;
    int32_t NodeKind() const override { return kNodeKind; }
    /// Text made in memory, status new.
    ZEBXmlText();
    explicit ZEBXmlText(const ZEBString& text);
    explicit ZEBXmlText(ZEBXmlNode* owner);
    explicit ZEBXmlText(UTIL::ITOVXmlDomNode* dom);
    /// A copy by CopyTo; a failure is thrown.
    ZEBXmlText(const ZEBXmlText& other);
    ZEBXmlText& operator=(const ZEBXmlText& other);
    using ZEBXmlNode::operator=;

    /// The target must be a text node; the text is copied too.
    TOVRESULT CopyTo(ZEBXmlNode& target) const override;
    /// Writes the text on the owning element's tag; a deleted node writes
    /// empty text.
    TOVRESULT Save(UTIL::ITOVXmlWriter* writer) override;

    /// Empty for a deleted node.
    ZEBString GetText() const;
    /// Sets the text and marks the node changed.
    TOVRESULT SetText(const ZEBString& text);

private:
    ZEBString m_Text;
};

}  // namespace XMLUtils
}  // namespace ZEB
