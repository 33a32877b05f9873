#pragma once
/// The `bext` TRK keywords with a letter index ("TRKa" for track 10).
#include <map>
#include <string>

namespace HelperFunctions {

/// Always an empty map, whatever `keywords` holds: letter-indexed keys have
/// never reached a clip, and the TRK names of clips already linked rest on
/// that.
std::map<std::string, std::string> ConvertAlphaIndexToNumber(const std::map<std::string, std::string>& keywords);

}  // namespace HelperFunctions
