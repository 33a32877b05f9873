#pragma once
/// A DOM view of a node that is neither element nor attribute.
#include "tov/host/HostXmlNodeBase.h"

using HostXmlDomNode = HostXmlNodeBase<UTIL::ITOVXmlDomNode, UTIL::IID_ITOVXmlDomNode>;
