// The time of day of a bext OriginationTime: separators and carries.
#include <gtest/gtest.h>

#include "reader/ParseOriginationTime.h"

namespace {

struct TimeRow {
    const char* text;
    short callerHours;
    bool ok;
    short hours, minutes, seconds;  // after the call; the caller starts at (callerHours, 0, 7)
};

TEST(ParseOriginationTime, SeparatorsAndCarries) {
    const TimeRow rows[] = {
        {"12:34:56", 0, true, 12, 34, 56},
        {"12-34-56", 0, true, 12, 34, 56},
        {"12.34.56", 0, true, 12, 34, 56},
        {"12 34 56", 0, true, 12, 34, 56},
        {"12_34_56", 0, true, 12, 34, 56},
        {"00:00:00", 0, true, 0, 0, 0},
        {"12/34/56", 0, false, 0, 0, 7},
        {"123:45:6", 0, false, 0, 0, 7},  // a digit as third character
        {"12:34:5", 0, false, 0, 0, 7},
        {"12:34:567", 0, false, 0, 0, 7},
        {"ab:cd:ef", 0, false, 0, 0, 7},
        {"-1:00:00", 0, false, 0, 0, 7},
        // Carries: 60 and more minutes or seconds move into the next unit.
        {"12:60:00", 0, true, 13, 0, 0},
        {"12:99:00", 0, true, 13, 39, 0},
        {"23:60:00", 0, false, 23, 0, 7},
        {"12:34:60", 0, true, 12, 35, 0},
        {"12:34:75", 0, true, 12, 35, 15},
        // Seconds carrying out of minute 59 keep the caller's seconds.
        {"22:59:60", 0, true, 23, 0, 7},
        {"23:59:60", 0, false, 23, 59, 7},
        // The hour's upper check reads the caller's hours, not the parsed ones.
        {"25:00:00", 0, true, 25, 0, 0},
        {"10:00:00", 24, false, 24, 0, 7},
    };
    for (const TimeRow& row : rows) {
        short hours = row.callerHours, minutes = 0, seconds = 7;
        EXPECT_EQ(Chunks::BEXT::ParseOriginationTime(row.text, hours, minutes, seconds), row.ok) << row.text;
        EXPECT_EQ(hours, row.hours) << row.text;
        EXPECT_EQ(minutes, row.minutes) << row.text;
        EXPECT_EQ(seconds, row.seconds) << row.text;
    }
}

}  // namespace
