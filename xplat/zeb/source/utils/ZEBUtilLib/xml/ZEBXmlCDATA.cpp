#include "xml/ZEBXmlCDATA.h"

#include "tov/sdk/TOVFailureStyle.h"

namespace ZEB {
namespace XMLUtils {

ZEBXmlCDATA::ZEBXmlCDATA() = default;

ZEBXmlCDATA::ZEBXmlCDATA(ZEBXmlNode* owner) : ZEBXmlNode(owner) {}

ZEBXmlCDATA::ZEBXmlCDATA(UTIL::ITOVXmlDomNode* dom) : ZEBXmlNode(dom) {}

ZEBXmlCDATA::ZEBXmlCDATA(const ZEBXmlCDATA& other) : ZEBXmlNode() { TOVCheck(other.CopyTo(*this)); }

ZEBXmlCDATA& ZEBXmlCDATA::operator=(const ZEBXmlCDATA& other) {
    ZEBXmlNode::operator=(other);
    return *this;
}

TOVRESULT ZEBXmlCDATA::Save(UTIL::ITOVXmlWriter* writer) { return writer ? TOV_OK : TOV_E_INVALIDARG; }

}  // namespace XMLUtils
}  // namespace ZEB
