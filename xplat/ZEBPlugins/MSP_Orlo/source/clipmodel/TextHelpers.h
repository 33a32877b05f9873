#pragma once
/// Small text helpers of the clip model: hex dumps, trimming, file names and
/// the TRK keys of track names.
#include <string>

namespace HelperFunctions {

/// The bytes as lower-case hex, two digits each, in order. Empty for a null
/// `data` or an odd `length`.
std::string HexDumpFromMemory(const char* data, unsigned long length);
/// A copy without `c` at either end; a text of only `c` gives "".
std::string TrimFromBeginningAndEnd(const std::string& text, char c);
/// What follows the last "/" or "\" of `path`, or the whole path without one.
std::string GetFullFileNameFromPath(const std::string& path);
/// True for a track-name key: "TRK" and one or two decimal digits.
bool IsKeywordTRK(const std::string& key);

}  // namespace HelperFunctions
