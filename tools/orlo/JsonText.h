#pragma once
/// JSON values as the tool prints them.
#include <nlohmann/json.hpp>
#include <string>

/// JSON text; bytes that are not UTF-8 (recorders put any bytes into text
/// fields) are replaced rather than failing.
std::string JsonDump(const nlohmann::ordered_json& value, int indent = -1);

/// One value on one line for a person: "-" for null, a text as it stands
/// unless it holds line breaks or other control characters (then quoted as
/// JSON), anything else as JSON.
std::string ShownValue(const nlohmann::ordered_json& value);
