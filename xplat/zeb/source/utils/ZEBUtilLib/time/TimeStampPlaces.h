#pragma once
/// The fixed places of a time stamp text, "YYYY-MM-DD hh:mm:ss" or the same
/// with "T" and a closing "Z".
#include <string>

#include "aaf/AAFTypes.h"

namespace ZEB {

/// Reads year, month, day, hour, minute and second with `atoi` at places 0, 5,
/// 8, 11, 14 and 17, field by field into `out`, and sets the fraction to 0.
/// The separators are not looked at. A text shorter than 17 characters throws
/// std::out_of_range when the missing place is reached; a text of 17 gives
/// second 0.
void ReadTimeStampPlaces(const std::string& text, _aafTimeStamp_t& out);

}  // namespace ZEB
