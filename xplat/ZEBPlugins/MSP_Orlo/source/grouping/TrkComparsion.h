#pragma once
/// The order of track-name keys ("TRK1", "TRK2", ... "TRK10") by their number.
#include <map>
#include <string>

namespace HelperFunctions {

/// True when the number after the first three characters of `a` is less than
/// that of `b`. False when either key is empty or either rest holds anything
/// but digits, so such a key is equivalent to every other one. Throws
/// std::out_of_range for a non-empty key shorter than three characters.
bool TrkComparsion(const std::string& a, const std::string& b);

/// `TrkComparsion` as a map's ordering.
struct TrkComparator {
    bool operator()(const std::string& a, const std::string& b) const { return TrkComparsion(a, b); }
};

/// Track names by TRK key, in the order of the keys' numbers.
using TrkMap = std::map<std::string, std::string, TrkComparator>;

}  // namespace HelperFunctions
