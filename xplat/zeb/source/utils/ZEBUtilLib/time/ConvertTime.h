#pragma once
/// AAF time stamps from a time value or a text.
#include "aaf/AAFTypes.h"
#include "tov/ITOVString.h"
#include "tov/TOVResult.h"

namespace ZEB {

/// The UTC date of `t` (seconds since 1970) with the time of day left 0: a
/// stamp made this way carries the date alone. TOV_E_INVALIDARG for a null
/// `out`, or for a moment too far off to break down (the record then stays
/// cleared).
TOVRESULT ConvertTime(long t, _aafTimeStamp_t* out);
/// Reads "YYYY-MM-DD hh:mm:ss" at its fixed places, separators unchecked;
/// fraction 0. TOV_E_INVALIDARG for a null `out`; TOV_E_UNEXPECTED for a text
/// shorter than 17 characters (the fields before the missing place are
/// written); a failure of the string as its own result.
TOVRESULT ConvertTimeString(ITOVString* text, _aafTimeStamp_t* out);

}  // namespace ZEB
