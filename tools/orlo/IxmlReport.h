#pragma once
/// What the reader makes of an iXML chunk's text, as JSON: the text after its
/// repairs, whether it parsed, and each value with null where it is absent.
#include <nlohmann/json.hpp>
#include <string>

#include "tov/ITOVComponentFactory.h"

nlohmann::ordered_json IxmlReport(const std::string& rawXml, ITOVComponentFactory* factory);
