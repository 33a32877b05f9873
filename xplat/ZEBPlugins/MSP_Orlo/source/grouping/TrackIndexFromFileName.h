#pragma once
/// The channel number of a numbered-suffix file name: Take7_3.wav is channel 3.
#include <string>

namespace VTImportGrouping {

/// The characters that end a name's prefix before its channel number.
inline constexpr const char* kDelimiters = "_- ";

/// True, with `index` set, when one or two characters between the last
/// delimiter and the last dot read as a number from 1 to 64; the read stops
/// at the first character that is not part of a number ("1a" is 1, "+3" is 3).
/// False, with `index` untouched, otherwise.
bool TrackIndexFromFileName(const std::string& name, int& index);

}  // namespace VTImportGrouping
