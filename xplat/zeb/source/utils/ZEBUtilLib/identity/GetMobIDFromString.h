#pragma once
/// A Mob ID from its 64 hexadecimal digits without separators.
#include "aaf/AAFTypes.h"
#include "tov/TOVResult.h"

namespace ZEB {

/// Fills `*out` from `text` read at fixed places: label bytes, length and
/// instance bytes, then the material as Data1, Data2, Data3 and Data4's bytes.
/// TOV_E_INVALIDARG for a null `out`; `text` must not be null. No conversion is
/// checked: a short or non-hexadecimal text leaves the bytes it cannot fill as
/// they were and still returns TOV_OK, so the text's validity is the caller's
/// matter.
TOVRESULT GetMobIDFromString(const char* text, _aafMobID_t* out);

}  // namespace ZEB
