// ZEBString over the host's string component: ownership, encodings, the
// lengths it hands over, comparisons and failures.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <utility>
#include <vector>

#include "MockString.h"
#include "StringFixture.h"
#include "TestText.h"
#include "strings/ZEBString.h"
#include "tov/sdk/TOVPtr.h"

namespace {

using ::testing::_;
using ::testing::DoAll;
using ::testing::Return;
using ::testing::SetArgPointee;
using ZEB::ZEBString;

// Every way of making a string meets the one check in CreateString.
TEST(ZEBStringBeforeStart, MakingAStringFailsWithNotReady) {
    ExpectThrowsResult([] { ZEBString s(U8("a")); }, ZEB_E_NOTREADY, "UTF-8 constructor");
    ExpectThrowsResult([] { ZEBString s(U16(u"a")); }, ZEB_E_NOTREADY, "UTF-16 constructor");
    ExpectThrowsResult([] { ZEBString s(U32(U"a")); }, ZEB_E_NOTREADY, "UTF-32 constructor");
}

using ZEBStringUnset = StringFixture;
using ZEBStringOwnership = StringFixture;
using ZEBStringEncoding = StringFixture;
using ZEBStringComparison = StringFixture;
using ZEBStringSearch = StringFixture;

TEST_F(ZEBStringUnset, ThrowsNotReadyUntilAStringIsMade) {
    ZEBString unset;
    ZEBString other(U8("x"));
    const std::vector<std::pair<const char*, std::function<void()>>> calls = {
        {"InArg", [&] { unset.InArg(); }},
        {"GetNumCharacters", [&] { unset.GetNumCharacters(); }},
        {"GetUnicodeType", [&] { unset.GetUnicodeType(); }},
        {"+= text", [&] { unset += U8("a"); }},
        {"+= string", [&] { unset += other; }},
        {"ConvertTo", [&] { unset.ConvertTo(kTOVUnicodeUTF8); }},
        {"GetUTF8String", [&] { unset.GetUTF8String(); }},
        {"==", [&] { (void)(unset == U8("a")); }},
        {"== as right operand", [&] { (void)(other == unset); }},
        {"FindString", [&] { unset.FindString(U8("a"), 0); }},
        {"copy", [&] { ZEBString copy(unset); }},
        {"assign from unset", [&] { other = unset; }},
        {"share a null source", [] { ZEBString s(kTOVUnicodeUTF8, nullptr); }},
        {"assign a null source", [&] { other = static_cast<ITOVString*>(nullptr); }},
    };
    for (const auto& [name, call] : calls) ExpectThrowsResult(call, ZEB_E_NOTREADY, name);

    EXPECT_EQ(unset.IsEmpty(), 1);
    unset.Clear();

    // An external buffer makes the string too; the text forms then work in it.
    unsigned char buffer[16] = "abc";
    unset.SetExternalBuffer(kTOVUnicodeUTF8, buffer, sizeof buffer);
    EXPECT_EQ(unset.IsEmpty(), 0);
    unset.SetCharacter(1, 0xE9u);
    EXPECT_STREQ(reinterpret_cast<const char*>(buffer), "aéc");
    unsigned int codePoint = 0;
    unset.GetCharacter(1, &codePoint);
    EXPECT_EQ(codePoint, 0xE9u);
    unsigned short unit[2] = {};
    unsigned int size = 2;
    unset.GetCharacter(2, unit, &size);
    EXPECT_EQ(size, 1u);
    EXPECT_EQ(unit[0], u'c');
    unsigned char* handedBack = nullptr;
    unset.RemoveExternalBuffer(&handedBack);
    EXPECT_EQ(handedBack, buffer);
    unset.ToUpper();
    EXPECT_EQ(TextOf(unset), L"AÉC");
}

TEST_F(ZEBStringEncoding, ConstructorsStoreTheTextInItsOwnEncoding) {
    ExpectMadeStrings({
        {"UTF-8", [] { return ZEBString(U8("Grüße")); }, kTOVUnicodeUTF8, L"Grüße"},
        {"UTF-16 pair", [] { return ZEBString(U16(u"a\U0001F600")); }, kTOVUnicodeUTF16, L"a\U0001F600"},
        {"UTF-32", [] { return ZEBString(U32(U"\u00E9t\u00E9")); }, kTOVUnicodeUTF32, L"été"},
        {"null UTF-8 is empty", [] { return ZEBString(static_cast<const unsigned char*>(nullptr)); }, kTOVUnicodeUTF8,
         L""},
    });
}

TEST_F(ZEBStringOwnership, SharingConstructorSharesOnlyInTheSameEncoding) {
    const ZEBString source(U16(u"abc"));
    {
        const ZEBString same(kTOVUnicodeUTF16, source.InArg());
        EXPECT_EQ(same.InArg(), source.InArg());
    }
    EXPECT_EQ(TextOf(source), L"abc") << "the shared string outlives the sharer";
    const ZEBString other(kTOVUnicodeUTF8, source.InArg());
    EXPECT_NE(other.InArg(), source.InArg());
    EXPECT_EQ(other.GetUnicodeType(), kTOVUnicodeUTF8);
    EXPECT_EQ(source.GetUnicodeType(), kTOVUnicodeUTF16);
    EXPECT_EQ(TextOf(other), L"abc");
}

// The fixture's count of live objects catches a string that is not given back.
TEST_F(ZEBStringOwnership, ViewsReleaseNothingOwnersAndOutArgTheirReference) {
    ITOVString* raw = nullptr;
    ZEBString::CreateString(&raw);
    TOVPtr<ITOVString> keeper(raw);
    { ZEBString view(raw, 0); }
    EXPECT_EQ(raw->AddRef(), 2u) << "the view released a reference it never had";
    {
        ZEBString view(raw, 0);
        ITOVString** slot = view.OutArg();
        EXPECT_EQ(*slot, nullptr);
        EXPECT_EQ(raw->AddRef(), 2u) << "OutArg releases even on a view";
        ZEBString::CreateString(slot);
    }                             // the filled string is the view's own now and goes with it
    { ZEBString owner(raw, 1); }  // takes over the reference added above
    ZEBString nullView(nullptr, 0);
    nullView = U8("made by the wrapper, so owned by it");
}

TEST_F(ZEBStringOwnership, CopiesAndAssignmentsTakeTheSourcesEncodingButNeverItsText) {
    ZEBString original(U8("abc"));
    ZEBString copy(original);
    EXPECT_NE(copy.InArg(), original.InArg());
    EXPECT_EQ(copy.GetUnicodeType(), kTOVUnicodeUTF8);
    copy += U8("d");
    EXPECT_EQ(TextOf(original), L"abc");
    EXPECT_EQ(TextOf(copy), L"abcd");

    const ZEBString source(U32(U"new"));
    original = source;
    EXPECT_EQ(original.GetUnicodeType(), kTOVUnicodeUTF32);
    EXPECT_NE(original.InArg(), source.InArg());
    EXPECT_EQ(TextOf(original), L"new");
    {
        ZEBString view(original.InArg(), 0);
        view = U16(u"rewritten");
    }
    EXPECT_EQ(TextOf(original), L"rewritten") << "assignment writes through a view";
}

// Against raw text `>` orders; against another string it means "differs".
TEST_F(ZEBStringComparison, CaseSensitiveInEveryEncoding) {
    struct Case {
        const char *left, *right;
        bool equal, less;
    };
    const std::vector<Case> cases = {
        {"abc", "abc", true, false},  {"abc", "abd", false, true}, {"abd", "abc", false, false},
        {"abc", "ABC", false, false}, {"ab", "abc", false, true},  {"", "", true, false},
    };
    for (const auto& c : cases) {
        const ZEBString left(U8(c.left));
        const std::u16string right16(c.right, c.right + std::char_traits<char>::length(c.right));
        const std::u32string right32(c.right, c.right + std::char_traits<char>::length(c.right));
        const ZEBString right(U8(c.right));
        const std::string label = std::string(c.left) + " vs " + c.right;
        EXPECT_EQ(left == U8(c.right), c.equal) << label;
        EXPECT_EQ(left == U16(right16.c_str()), c.equal) << label;
        EXPECT_EQ(left == U32(right32.c_str()), c.equal) << label;
        EXPECT_EQ(left == right, c.equal) << label;
        EXPECT_EQ(left != U16(right16.c_str()), !c.equal) << label;
        EXPECT_EQ(left != right.InArg(), !c.equal) << label;
        EXPECT_EQ(left < U32(right32.c_str()), c.less) << label;
        EXPECT_EQ(left < right, c.less) << label;
        EXPECT_EQ(left > U8(c.right), !c.equal && !c.less) << label;
        EXPECT_EQ(left > U16(right16.c_str()), !c.equal && !c.less) << label;
        EXPECT_EQ(left > right, !c.equal) << label;
        EXPECT_EQ(left > right.InArg(), !c.equal) << label;
    }
    EXPECT_EQ(ZEBString(U8("abc")).Compare(U8("ABC"), 4, 0), 0) << "flag 0 lets case go";
}

TEST_F(ZEBStringSearch, GivesCharacterIndexesOrMinusOne) {
    // The emoji takes two UTF-16 units but is one character.
    const ZEBString s(U16(u"\U0001F600ab-ab"));
    const ZEBString needle(U8("ab"));
    EXPECT_EQ((std::vector<int>{s.FindString(U8("ab"), 0), s.FindString(U16(u"ab"), 2), s.FindString(U32(U"ab"), 5),
                                s.FindString(needle.InArg(), 0), s.FindString(U8("zz"), 0)}),
              (std::vector<int>{1, 4, -1, 1, -1}));
    EXPECT_EQ((std::vector<int>{s.FindStringReverse(U8("ab"), -1), s.FindStringReverse(U16(u"ab"), 3),
                                s.FindStringReverse(U32(U"ab"), 0), s.FindStringReverse(needle.InArg(), -1)}),
              (std::vector<int>{4, 1, -1, 4}));
}

TEST_F(ZEBStringEncoding, ConcatenationTakesTheEncodingOfTheLeftOperand) {
    const ZEBString utf8(U8("a"));
    const ZEBString utf16(U16(u"b"));
    ExpectMadeStrings({
        {"string + string", [&] { return utf8 + utf16; }, kTOVUnicodeUTF8, L"ab"},
        {"string + UTF-8", [&] { return utf16 + U8("c"); }, kTOVUnicodeUTF16, L"bc"},
        {"string + UTF-16", [&] { return utf8 + U16(u"\u00E9"); }, kTOVUnicodeUTF8, L"aé"},
        {"string + UTF-32", [&] { return utf8 + U32(U"d"); }, kTOVUnicodeUTF8, L"ad"},
        {"UTF-8 + string", [&] { return U8("c") + utf16; }, kTOVUnicodeUTF8, L"cb"},
        {"UTF-16 + string", [&] { return U16(u"c") + utf8; }, kTOVUnicodeUTF16, L"ca"},
        {"UTF-32 + string", [&] { return U32(U"c") + utf8; }, kTOVUnicodeUTF32, L"ca"},
    });
    EXPECT_EQ(TextOf(utf8), L"a") << "the operands stay as they were";
    EXPECT_EQ(TextOf(utf16), L"b");
}

TEST_F(ZEBStringEncoding, TextTheComponentRefusesIsThrownAsItsResult) {
    ZEBString s(U8("abc"));
    ExpectThrowsResult([&] { s = U8("\xC3("); }, TOV_E_INVALIDARG, "malformed UTF-8");
    EXPECT_EQ(TextOf(s), L"abc");
    ExpectThrowsResult([&] { ZEBString bad(U8("\xFF")); }, TOV_E_INVALIDARG, "malformed text in a constructor");
    ExpectThrowsResult([&] { s.ConvertTo(static_cast<_tovUnicodeType>(9)); }, TOV_E_INVALIDARG, "unknown encoding");
}

// The counts that go with raw text cannot be seen through a real string.
TEST(ZEBStringCounts, RawTextIsCountedAsEachFormRequires) {
    MockString mock;
    EXPECT_CALL(mock, Release()).Times(0);
    ZEBString view(&mock, 0);
    const unsigned char* abc = U8("abc");
    const unsigned short* abc16 = U16(u"abc");
    const unsigned int* abc32 = U32(U"abc");
    const unsigned char* none = nullptr;

    EXPECT_CALL(mock, Assign(kTOVUnicodeUTF8, abc, 4u)).WillOnce(Return(TOV_OK));
    EXPECT_CALL(mock, Assign(kTOVUnicodeUTF8, none, 1u)).WillOnce(Return(TOV_OK));
    EXPECT_CALL(mock, Assign(kTOVUnicodeUTF16, abc16, 2u)).WillOnce(Return(TOV_OK));
    view = abc;
    view = none;
    view.Assign(kTOVUnicodeUTF16, abc16, 2);

    EXPECT_CALL(mock, Append(abc32, 4u)).WillOnce(Return(TOV_OK));
    EXPECT_CALL(mock, Append(abc, 7u)).WillOnce(Return(TOV_OK));
    view += abc32;
    view.Append(abc, 7);

    EXPECT_CALL(mock, Compare(abc16, 4u, _, 1)).Times(4).WillRepeatedly(Return(TOV_OK));
    EXPECT_CALL(mock, Compare(none, 1u, _, 1)).WillOnce(Return(TOV_OK));
    EXPECT_CALL(mock, Compare(abc, 2u, _, 0)).WillOnce(Return(TOV_OK));
    (void)(view == abc16);
    (void)(view != abc16);
    (void)(view < abc16);
    (void)(view > abc16);
    (void)(view == none);
    view.Compare(abc, 2, 0);

    EXPECT_CALL(mock, FindString(abc, 3u, 5, _)).WillOnce(Return(TOV_OK));
    EXPECT_CALL(mock, FindString(none, 0u, 0, _)).WillOnce(Return(TOV_OK));
    EXPECT_CALL(mock, FindStringReverse(abc32, 3u, -1, _)).WillOnce(Return(TOV_OK));
    view.FindString(abc, 5);
    view.FindString(none, 0);
    view.FindStringReverse(abc32, -1);
}

TEST(ZEBStringCounts, ResultsStartAtZeroAndPositionsAtMinusOne) {
    MockString mock;
    ZEBString view(&mock, 0);
    EXPECT_CALL(mock, Compare(::testing::An<const unsigned char*>(), _, _, _)).WillRepeatedly(Return(TOV_OK));
    EXPECT_CALL(mock, FindString(::testing::An<const unsigned char*>(), _, _, _)).WillRepeatedly(Return(TOV_OK));
    EXPECT_CALL(mock, FindStringReverse(::testing::An<const unsigned char*>(), _, _, _))
        .WillOnce(DoAll(SetArgPointee<3>(7), Return(TOV_OK)));
    EXPECT_EQ(view.Compare(U8("x"), 2, 1), 0);
    EXPECT_TRUE(view == U8("x")) << "a component that writes no result means equal";
    EXPECT_EQ(view.FindString(U8("x"), 0), -1) << "a search that writes nothing found nothing";
    EXPECT_EQ(view.FindStringReverse(U8("x"), 0), 7);
}

}  // namespace
