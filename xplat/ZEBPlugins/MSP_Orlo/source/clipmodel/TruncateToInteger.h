#pragma once
/// Conversions of a double to an integer that are defined for every value.
#include <cstdint>

namespace HelperFunctions {

/// The value truncated towards zero. A value out of range, infinite or not a
/// number gives INT32_MIN, as the processor's conversion does; for timecodes
/// that is the marker for no value.
int32_t TruncateToInt32(double value);

/// The same in 64 bits: out of range gives INT64_MIN.
int64_t TruncateToInt64(double value);

}  // namespace HelperFunctions
