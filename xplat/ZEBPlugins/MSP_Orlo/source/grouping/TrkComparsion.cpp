#include "grouping/TrkComparsion.h"

#include <cstdlib>

namespace HelperFunctions {

namespace {

bool AllDigits(const std::string& text) {
    for (const char c : text) {
        if (c < '0' || c > '9') return false;
    }
    return true;
}

}  // namespace

bool TrkComparsion(const std::string& a, const std::string& b) {
    if (a.empty() || b.empty()) return false;
    // The prefix is not looked at: "ABC2" and "TRK2" are the same key.
    const std::string numberA = a.substr(3);
    const std::string numberB = b.substr(3);
    if (!AllDigits(numberA) || !AllDigits(numberB)) return false;
    // An empty rest reads as 0.
    return std::atoi(numberA.c_str()) < std::atoi(numberB.c_str());
}

}  // namespace HelperFunctions
