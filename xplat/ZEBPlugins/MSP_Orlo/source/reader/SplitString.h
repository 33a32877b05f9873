#pragma once
#include <string>
#include <vector>

namespace HelperFunctions {

/// The pieces of `text` between the `delimiter`s, empty pieces included:
/// "25/" gives "25" and "".
std::vector<std::string> SplitString(const std::string& text, char delimiter);

}  // namespace HelperFunctions
