#include "clipmodel/TruncateToInteger.h"

#include <limits>

namespace HelperFunctions {

namespace {

template <typename T>
T Truncate(double value) {
    // The lowest value is a power of two, exact in a double; NaN fails both
    // comparisons and so counts as out of range.
    constexpr double low = static_cast<double>(std::numeric_limits<T>::min());
    if (value < -low && value > low - 1.0) return static_cast<T>(value);
    return std::numeric_limits<T>::min();
}

}  // namespace

int32_t TruncateToInt32(double value) { return Truncate<int32_t>(value); }

int64_t TruncateToInt64(double value) { return Truncate<int64_t>(value); }

}  // namespace HelperFunctions
