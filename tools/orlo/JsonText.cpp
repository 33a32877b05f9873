#include "JsonText.h"

#include <algorithm>

std::string JsonDump(const nlohmann::ordered_json& value, int indent) {
    return value.dump(indent, ' ', false, nlohmann::ordered_json::error_handler_t::replace);
}

std::string ShownValue(const nlohmann::ordered_json& value) {
    if (value.is_null()) return "-";
    if (!value.is_string()) return JsonDump(value);
    const std::string& text = value.get_ref<const std::string&>();
    const bool plain = std::none_of(text.begin(), text.end(), [](char c) { return c >= 0 && c < 0x20; });
    return plain ? text : JsonDump(value);
}
