#include "ToggleSetting.h"

#include <algorithm>
#include <iterator>

#include "boundary/OrloConstants.h"

namespace {

const char* const kTogglePaths[] = {toggle_MobIDFromiXML, toggle_StartTimeCodeFromFileCreationTime,
                                    toggle_StartTimeCodeFromBEXTOriginationDate, toggle_BigEndianSmpteIdInBEXTData,
                                    toggle_IgnoreHostSettingsForUnitTest};

std::string KnownPaths() {
    std::string known;
    for (const char* path : kTogglePaths) known += std::string("\n  ") + path;
    return known;
}

// Decimal digits only: a sign, blanks or a base prefix would hide typing errors.
bool ParseValue(const std::string& text, uint32_t& value) {
    if (text.empty() || text.size() > 10 ||
        !std::all_of(text.begin(), text.end(), [](char c) { return c >= '0' && c <= '9'; }))
        return false;
    const unsigned long long number = std::stoull(text);
    if (number > UINT32_MAX) return false;
    value = static_cast<uint32_t>(number);
    return true;
}

}  // namespace

std::string ToggleSetting::Parse(const std::string& text, ToggleSetting& out) {
    const size_t equals = text.rfind('=');
    if (equals == std::string::npos) return "'" + text + "' is not PATH=VALUE";
    const std::string path = text.substr(0, equals);
    const std::string value = text.substr(equals + 1);
    if (std::find(std::begin(kTogglePaths), std::end(kTogglePaths), path) == std::end(kTogglePaths))
        return "'" + path + "' is not a toggle of the plug-in; the toggles are:" + KnownPaths();
    if (!ParseValue(value, out.value)) return "'" + value + "' is not an unsigned 32-bit number (toggle " + path + ")";
    out.path = path;
    return "";
}
