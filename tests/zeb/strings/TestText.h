#pragma once
/// Literals in the pointer types of the string interfaces, and a string's
/// text read back for comparison.
#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <vector>

#include "strings/ZEBString.h"

inline const unsigned char* U8(const char* text) { return reinterpret_cast<const unsigned char*>(text); }
inline const unsigned short* U16(const char16_t* text) { return reinterpret_cast<const unsigned short*>(text); }
inline const unsigned int* U32(const char32_t* text) { return reinterpret_cast<const unsigned int*>(text); }

/// The text as code points, whatever the string's encoding.
inline std::wstring TextOf(const ZEB::ZEBString& s) {
    std::wstring text;
    for (const unsigned int* unit = s.GetUTF32String(); *unit != 0; ++unit) text += static_cast<wchar_t>(*unit);
    return text;
}

/// A string made one way, and the encoding and text it must have.
struct MadeString {
    const char* name;
    std::function<ZEB::ZEBString()> make;
    _tovUnicodeType type;
    std::wstring text;
};

inline void ExpectMadeStrings(const std::vector<MadeString>& cases) {
    for (const auto& c : cases) {
        const ZEB::ZEBString s = c.make();
        EXPECT_EQ(s.GetUnicodeType(), c.type) << c.name;
        EXPECT_EQ(TextOf(s), c.text) << c.name;
    }
}

/// Runs `call` and expects it to throw `expected` as an int.
inline void ExpectThrowsResult(const std::function<void()>& call, TOVRESULT expected, const std::string& what) {
    try {
        call();
        ADD_FAILURE() << what << ": nothing thrown";
    } catch (int result) {
        EXPECT_EQ(result, expected) << what;
    }
}
