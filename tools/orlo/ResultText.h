#pragma once
/// A result code as the tool shows it.
#include <nlohmann/json.hpp>
#include <string>

#include "tov/TOVResult.h"

/// "0x8000FFFF": eight upper-case hex digits.
std::string ResultText(TOVRESULT result);
/// 0 as a number for success, otherwise the code as `ResultText`.
nlohmann::ordered_json ResultJson(TOVRESULT result);
/// Says on stderr "orlo: WHAT (CODE)" when `result` is negative; gives `result` back.
TOVRESULT SayRefused(TOVRESULT result, const std::string& what);
