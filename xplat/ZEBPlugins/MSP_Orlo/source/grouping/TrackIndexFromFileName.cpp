#include "grouping/TrackIndexFromFileName.h"

#include <sstream>

namespace VTImportGrouping {

namespace {

constexpr int kFirstChannel = 1;
constexpr int kLastChannel = 64;

}  // namespace

bool TrackIndexFromFileName(const std::string& name, int& index) {
    const size_t dot = name.rfind('.');
    const size_t delimiter = name.find_last_of(kDelimiters);
    if (dot == std::string::npos || delimiter == std::string::npos) return false;
    // A delimiter behind the last dot leaves no text between them.
    if (delimiter > dot) return false;
    const size_t length = dot - delimiter - 1;
    if (length < 1 || length > 2) return false;
    std::istringstream text(name.substr(delimiter + 1, length));
    int value = 0;
    if (!(text >> value)) return false;
    if (value < kFirstChannel || value > kLastChannel) return false;
    index = value;
    return true;
}

}  // namespace VTImportGrouping
