#pragma once
/// Parsing the text of an `iXML` chunk into IXMLData through the XML document
/// model. Kept apart from the chunk walk because the model needs the host.
#include <string>

#include "reader/ixml/IXMLData.h"
#include "tov/ITOVComponentFactory.h"
#include "xml/ZEBXmlElement.h"

namespace Chunks {
namespace IXML {

/// Reads the direct children of the root that the clip model uses. Returns 0
/// and sets `data.parsed`, or a result code with `parsed` left false (values
/// read before the failure stay filled and mean nothing).
TOVRESULT ParceRawIXML(const std::string& rawXml, ITOVComponentFactory* factory, IXMLData& data);

/// Adds a TRACK element's values to the list; other elements are ignored.
void GetTrackFromXMLWithNameCheck(ZEB::XMLUtils::ZEBXmlElement* element, IXMLData* data);

}  // namespace IXML
}  // namespace Chunks
