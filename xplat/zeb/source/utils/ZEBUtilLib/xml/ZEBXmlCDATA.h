#pragma once
/// A CDATA section of the lazy XML tree. It is read like any node, but it is
/// not text: an element's text leaves it out, and saving drops it.
#include "xml/ZEBXmlNode.h"

namespace ZEB {
namespace XMLUtils {

class ZEBXmlCDATA : public ZEBXmlNode {
public:
    static constexpr int32_t kNodeKind = 4;
    int32_t NodeKind() const override { return kNodeKind; }
    /// A section made in memory, status new.
    ZEBXmlCDATA();
    explicit ZEBXmlCDATA(ZEBXmlNode* owner);
    explicit ZEBXmlCDATA(UTIL::ITOVXmlDomNode* dom);
    /// A copy by CopyTo; a failure is thrown.
    ZEBXmlCDATA(const ZEBXmlCDATA& other);
    ZEBXmlCDATA& operator=(const ZEBXmlCDATA& other);
    using ZEBXmlNode::operator=;

    /// Writes nothing: the writer has no form for CDATA, so sections are lost
    /// on saving. TOV_E_INVALIDARG without a writer.
    TOVRESULT Save(UTIL::ITOVXmlWriter* writer) override;
};

}  // namespace XMLUtils
}  // namespace ZEB
