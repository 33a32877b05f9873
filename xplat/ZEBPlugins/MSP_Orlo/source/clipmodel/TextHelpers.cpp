#include "clipmodel/TextHelpers.h"

#include "identity/IDText.h"

namespace HelperFunctions {

namespace {

bool IsDigit(char c) { return c >= '0' && c <= '9'; }

}  // namespace

std::string HexDumpFromMemory(const char* data, unsigned long length) {
    if (!data || length % 2 != 0) return std::string();
    return ZEB::HexText(reinterpret_cast<const unsigned char*>(data), length, ZEB::HexCase::Lower);
}

std::string TrimFromBeginningAndEnd(const std::string& text, char c) {
    const size_t first = text.find_first_not_of(c);
    if (first == std::string::npos) return std::string();
    return text.substr(first, text.find_last_not_of(c) - first + 1);
}

std::string GetFullFileNameFromPath(const std::string& path) {
    const size_t separator = path.find_last_of("/\\");
    return separator == std::string::npos ? path : path.substr(separator + 1);
}

bool IsKeywordTRK(const std::string& key) {
    if (key.size() != 4 && key.size() != 5) return false;
    if (key.compare(0, 3, "TRK") != 0) return false;
    for (size_t i = 3; i < key.size(); ++i) {
        if (!IsDigit(key[i])) return false;
    }
    return true;
}

}  // namespace HelperFunctions
