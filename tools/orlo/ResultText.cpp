#include "ResultText.h"

#include <cstdio>

std::string ResultText(TOVRESULT result) {
    char code[16];
    std::snprintf(code, sizeof code, "0x%08X", static_cast<unsigned>(result));
    return code;
}

nlohmann::ordered_json ResultJson(TOVRESULT result) {
    return result == TOV_OK ? nlohmann::ordered_json(0) : nlohmann::ordered_json(ResultText(result));
}

TOVRESULT SayRefused(TOVRESULT result, const std::string& what) {
    if (result < 0) std::fprintf(stderr, "orlo: %s (%s)\n", what.c_str(), ResultText(result).c_str());
    return result;
}
