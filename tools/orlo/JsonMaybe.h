#pragma once
/// The tool's rule for absent values: a value whose has flag is false is null.
#include <nlohmann/json.hpp>

template <typename T>
nlohmann::ordered_json JsonMaybe(bool has, const T& value) {
    return has ? nlohmann::ordered_json(value) : nlohmann::ordered_json(nullptr);
}
