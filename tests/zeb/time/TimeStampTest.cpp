// AAF time stamps from time values and texts, and their text forms.
#include <gtest/gtest.h>

#include <climits>
#include <cstring>
#include <stdexcept>
#include <string>
#include <vector>

#include "StringFixture.h"
#include "TestText.h"
#include "time/ConvertTime.h"
#include "time/TimeStampText.h"

namespace {

using namespace ZEB;
using namespace ZEB::AAFUtils;

_aafTimeStamp_t Stamp(int year, int month, int day, int hour, int minute, int second) {
    return {{static_cast<aafInt16>(year), static_cast<aafUInt8>(month), static_cast<aafUInt8>(day)},
            {static_cast<aafUInt8>(hour), static_cast<aafUInt8>(minute), static_cast<aafUInt8>(second), 0}};
}

bool operator==(const _aafTimeStamp_t& a, const _aafTimeStamp_t& b) {
    return a.date.year == b.date.year && a.date.month == b.date.month && a.date.day == b.date.day &&
           a.time.hour == b.time.hour && a.time.minute == b.time.minute && a.time.second == b.time.second &&
           a.time.fraction == b.time.fraction;
}

std::string Text(const ZEBString& s) { return reinterpret_cast<const char*>(s.GetUTF8String()); }

_aafTimeStamp_t Stale() {
    _aafTimeStamp_t stamp;
    std::memset(&stamp, 0xEE, sizeof stamp);
    return stamp;
}

TEST(ConvertTime, GivesTheUTCDateAlone) {
    struct Case {
        long t;
        _aafTimeStamp_t expected;
    };
    const std::vector<Case> cases = {{951782400, Stamp(2000, 2, 29, 0, 0, 0)},
                                     {951782400 + 86399, Stamp(2000, 2, 29, 0, 0, 0)},
                                     {-1, Stamp(1969, 12, 31, 0, 0, 0)}};
    for (const auto& c : cases) {
        _aafTimeStamp_t out = Stale();
        EXPECT_EQ(ConvertTime(c.t, &out), TOV_OK) << c.t;
        EXPECT_TRUE(out == c.expected) << c.t;
    }
    EXPECT_EQ(ConvertTime(0, nullptr), TOV_E_INVALIDARG);
    _aafTimeStamp_t out = Stale();
    EXPECT_EQ(ConvertTime(LONG_MAX, &out), TOV_E_INVALIDARG);
    EXPECT_TRUE(out == _aafTimeStamp_t{}) << "a moment out of reach leaves the record cleared";
}

class TimeStampText : public StringFixture {};

TEST_F(TimeStampText, ConvertTimeStringReadsFixedPlaces) {
    struct Case {
        const char* text;
        _aafTimeStamp_t expected;
    };
    const std::vector<Case> cases = {
        {"2024-03-05 06:07:08", Stamp(2024, 3, 5, 6, 7, 8)},
        {"2024/03/05x06.07.08", Stamp(2024, 3, 5, 6, 7, 8)},  // separators are not looked at
        {"2024-03-05 06:07:", Stamp(2024, 3, 5, 6, 7, 0)},    // 17 characters: second 0
        {"2024-3-5 6:7:8:99", Stamp(2024, 3, 6, 7, 0, 0)},    // places, not fields
    };
    for (const auto& c : cases) {
        ZEBString text(U8(c.text));
        _aafTimeStamp_t out = Stale();
        EXPECT_EQ(ConvertTimeString(text.InArg(), &out), TOV_OK) << c.text;
        EXPECT_TRUE(out == c.expected) << c.text;
        EXPECT_TRUE(TimeStampFromStringUTC(text) == c.expected) << c.text;
    }
}

TEST_F(TimeStampText, TooShortTextsFail) {
    ZEBString s(U8("2024-03-05 06:07"));  // one short of the second's place
    _aafTimeStamp_t out = Stale();
    EXPECT_EQ(ConvertTimeString(s.InArg(), &out), TOV_E_UNEXPECTED);
    EXPECT_THROW(TimeStampFromStringUTC(s), std::out_of_range);
    ZEBString ok(U8("2024-03-05 06:07:08"));
    EXPECT_EQ(ConvertTimeString(ok.InArg(), nullptr), TOV_E_INVALIDARG);
    EXPECT_EQ(ConvertTimeString(nullptr, &out), ZEB_E_NOTREADY) << "the string's own failure comes back as it is";
}

TEST_F(TimeStampText, TextForms) {
    struct Case {
        _aafTimeStamp_t stamp;
        const char *plain, *utc, *local;
    };
    const std::vector<Case> cases = {
        {Stamp(2024, 3, 5, 6, 7, 8), "2024-03-05 06:07:08", "2024-03-05T06:07:08Z", "2024-03-05T06:07:08"},
        {Stamp(7, 1, 1, 0, 0, 0), "0007-01-01 00:00:00", "0007-01-01T00:00:00Z", "0007-01-01T00:00:00"},
        {Stamp(-1, 12, 31, 23, 59, 59), "4294967295-12-31 23:59:59", "4294967295-12-31T23:59:59Z",
         "4294967295-12-31T23:59:59"},
        // The 30-byte buffer cuts the widest values.
        {Stamp(-1, 255, 255, 255, 255, 255), "4294967295-255-255 255:255:25", "4294967295-255-255T255:255:25",
         "4294967295-255-255T255:255:25"},
    };
    for (const auto& c : cases) {
        EXPECT_EQ(Text(TimeStamptoString(c.stamp)), c.plain);
        EXPECT_EQ(Text(TimeStampToStringUTC(c.stamp)), c.utc);
        EXPECT_EQ(Text(TimeStampToStringLocal(c.stamp)), c.local);
    }
}

TEST_F(TimeStampText, DateIsTheFirstTenCharactersInUTF8) {
    struct Case {
        std::u16string text;
        const char* date;
    };
    const std::vector<Case> cases = {
        {u"2024-03-05T06:07:08Z", "2024-03-05"},
        {u"2024-03", "2024-03"},
        {u"\u00E9\u00E9\u00E9\u00E9-\u20AC\u20AC-\u00E9\u00E9tail",
         "\xC3\xA9\xC3\xA9\xC3\xA9\xC3\xA9-\xE2\x82\xAC\xE2\x82\xAC-\xC3\xA9\xC3\xA9"},
    };
    for (const auto& c : cases) {
        const ZEBString date = TimeStampToDate(ZEBString(reinterpret_cast<const unsigned short*>(c.text.c_str())));
        EXPECT_EQ(date.GetUnicodeType(), kTOVUnicodeUTF8) << c.date;
        EXPECT_EQ(Text(date), c.date);
    }
}

}  // namespace
