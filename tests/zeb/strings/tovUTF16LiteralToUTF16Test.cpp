// Literal buffers: conversion, ownership of the buffer, and the four messages.
#include <gtest/gtest.h>

#include <cstring>
#include <limits>
#include <new>
#include <string>

#include "strings/tovUTF16LiteralToUTF16.h"

namespace {

std::u16string TextOf(const tovUTF16LiteralToUTF16& literal) {
    return std::u16string(reinterpret_cast<const char16_t*>(static_cast<const unsigned short*>(literal)));
}

// Runs `call` and expects it to throw exactly `message` as a const char*.
template <class Call>
void ExpectMessage(Call call, const char* message) {
    try {
        call();
        ADD_FAILURE() << "nothing thrown, expected: " << message;
    } catch (const char* thrown) {
        EXPECT_STREQ(thrown, message);
    }
}

constexpr __tovStringLiteralRef kHello = tovStringLiteral(u"h\u00E9llo \U0001F600");
constexpr __tovStringLiteralRef kOther = tovStringLiteral(u"other");

TEST(tovUTF16LiteralToUTF16, ConvertsTheLiteralAndCopiesOwnTheirBuffers) {
    const tovUTF16LiteralToUTF16 original(&kHello);
    EXPECT_EQ(TextOf(original), u"h\u00E9llo \U0001F600");
    const tovUTF16LiteralToUTF16 copy(original);
    EXPECT_NE(static_cast<const unsigned short*>(copy), static_cast<const unsigned short*>(original));
    EXPECT_EQ(TextOf(copy), TextOf(original));

    tovUTF16LiteralToUTF16 assigned(&kOther);
    assigned = original;
    EXPECT_NE(static_cast<const unsigned short*>(assigned), static_cast<const unsigned short*>(original));
    EXPECT_EQ(TextOf(assigned), TextOf(original));

    tovUTF16LiteralToUTF16 left(&kHello);
    tovUTF16LiteralToUTF16 right(&kOther);
    const unsigned short* leftBuffer = left;
    left.swap(right);
    EXPECT_EQ(static_cast<const unsigned short*>(right), leftBuffer) << "swap exchanges buffers, it copies nothing";
    EXPECT_EQ(TextOf(left), u"other");
}

TEST(tovUTF16LiteralToUTF16, FailuresThrowTheirMessages) {
    ExpectMessage([] { tovUTF16LiteralToUTF16 literal(nullptr); },
                  "tovUTF16LiteralToUTF16::tovUTF16LiteralToUTF16(tovStringLiteralRef rhs) failed with rhs == 0!");
    ExpectMessage([] { tovUTF16LiteralToUTF16().ConvertStringRefToUTF16(); },
                  "tovUTF16LiteralToUTF16::ConvertStringRefToUTF16 failed with mStrngRef == 0!");
    static constexpr __tovStringLiteralRef kNoText{nullptr, 3};
    ExpectMessage([] { tovUTF16LiteralToUTF16 literal(&kNoText); },
                  "tovUTF16LiteralToUTF16::ConvertStringRefToUTF16 failed because CFStringGetCString return FALSE!");
    ExpectMessage([] { (void)static_cast<const unsigned short*>(tovUTF16LiteralToUTF16()); },
                  "tovUTF16LiteralToUTF16: mUTF16 was NULL!");
    // Assigning a default object drops the buffer along with the literal.
    tovUTF16LiteralToUTF16 emptied(&kHello);
    emptied = tovUTF16LiteralToUTF16();
    ExpectMessage([&] { (void)static_cast<const unsigned short*>(emptied); },
                  "tovUTF16LiteralToUTF16: mUTF16 was NULL!");
}

TEST(tovUTF16LiteralToUTF16, AnUnrepresentableSizeFailsToAllocate) {
    for (std::size_t length : {std::numeric_limits<std::size_t>::max() / 2, std::numeric_limits<std::size_t>::max()}) {
        const __tovStringLiteralRef huge{u"", length};
        EXPECT_THROW(tovUTF16LiteralToUTF16 literal(&huge), std::bad_alloc) << length;
    }
}

TEST(tovStringLiteralRef, GetCStringRefusesWhatItCannotWrite) {
    char16_t buffer[8];
    std::memset(buffer, 0x55, sizeof buffer);
    EXPECT_FALSE(kOther.GetCString(buffer, sizeof buffer, 0)) << "only UTF-16 is offered";
    EXPECT_FALSE(kOther.GetCString(buffer, 11, kTOVStringEncodingUnicode)) << "no room for the terminator";
    EXPECT_EQ(buffer[0], 0x5555) << "a refusal writes nothing";
    ASSERT_TRUE(kOther.GetCString(buffer, 12, kTOVStringEncodingUnicode));
    EXPECT_EQ(std::u16string(buffer), u"other");
    EXPECT_EQ(kOther.Length(), 5u);
}

}  // namespace
