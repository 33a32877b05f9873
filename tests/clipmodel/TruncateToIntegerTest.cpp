// Truncation of doubles that is defined for every value.
#include <gtest/gtest.h>

#include <cmath>
#include <cstdint>

#include "clipmodel/TruncateToInteger.h"

namespace {

using namespace HelperFunctions;

TEST(TruncateToIntegerTest, TowardsZeroInRangeLowestOutside) {
    EXPECT_EQ(TruncateToInt32(2.9), 2);
    EXPECT_EQ(TruncateToInt32(-2.9), -2);
    EXPECT_EQ(TruncateToInt32(2147483647.9), INT32_MAX);
    EXPECT_EQ(TruncateToInt32(2147483648.0), INT32_MIN);
    EXPECT_EQ(TruncateToInt32(-2147483649.0), INT32_MIN);
    EXPECT_EQ(TruncateToInt32(std::nan("")), INT32_MIN);
    EXPECT_EQ(TruncateToInt64(-7.5), -7);
    EXPECT_EQ(TruncateToInt64(9223372036854775808.0), INT64_MIN);
    EXPECT_EQ(TruncateToInt64(-HUGE_VAL), INT64_MIN);
}

}  // namespace
