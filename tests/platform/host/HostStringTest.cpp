// The host's string component, driven through its interface only.
#include <gtest/gtest.h>

#include <cstring>
#include <functional>
#include <string>
#include <vector>

#include "tov/host/HostString.h"
#include "tov/host/UnicodeCodec.h"
#include "tov/sdk/TOVPtr.h"

namespace {

constexpr _tovUnicodeType kTypes[] = {kTOVUnicodeUTF8, kTOVUnicodeUTF16, kTOVUnicodeUTF32, kTOVUnicodeWCHAR};
constexpr int kForms = 4;  // the pointer forms: UTF-8, UTF-16, UTF-32, wchar_t

// A-acute-euro-grinning face: one, two, three and four UTF-8 bytes, the last a surrogate pair in UTF-16.
const char kMixedUTF8[] = u8"Aé€😀";
const std::u32string kMixed = U"Aé€😀";

const unsigned char* Bytes(const char* text) { return reinterpret_cast<const unsigned char*>(text); }

// Calls `op(pointer, n)` with `text` in pointer form `form`, so one case covers every overload.
template <class Op>
TOVRESULT InForm(int form, std::u32string_view text, Op op) {
    const std::string utf8 = UnicodeCodec::EncodeUTF8(text);
    const std::vector<unsigned short> utf16 = UnicodeCodec::EncodeUTF16(text);
    const std::vector<unsigned int> utf32 = UnicodeCodec::EncodeUTF32(text);
    const std::wstring wide(text.begin(), text.end());
    if (form == 0) return op(Bytes(utf8.c_str()), static_cast<unsigned int>(utf8.size()));
    if (form == 1) return op(utf16.data(), static_cast<unsigned int>(utf16.size()));
    if (form == 2) return op(utf32.data(), static_cast<unsigned int>(utf32.size()));
    return op(wide.c_str(), static_cast<unsigned int>(wide.size()));
}

TOVPtr<ITOVString> NewString(_tovUnicodeType type, std::u32string_view text) {
    TOVPtr<ITOVString> s;
    EXPECT_EQ(::HostString::TOVCreate(nullptr, nullptr, IID_ITOVString, s.Out()), TOV_OK);
    EXPECT_EQ(InForm(3, text, [&](auto p, unsigned int n) { return s->Assign(type, p, n); }), TOV_OK);
    return s;
}

std::string UTF8Of(ITOVString* s) {
    const unsigned char* p = nullptr;
    EXPECT_EQ(s->GetUTF8String(&p), TOV_OK);
    return reinterpret_cast<const char*>(p);
}

// The zero-terminated view that `get` hands out, as a string of `Char`.
template <class Char, class Unit>
std::basic_string<Char> ViewOf(ITOVString* s, TOVRESULT (ITOVString::*get)(const Unit**)) {
    const Unit* p = nullptr;
    EXPECT_EQ((s->*get)(&p), TOV_OK);
    std::basic_string<Char> text;
    while (*p) text += static_cast<Char>(*p++);
    return text;
}
std::u16string UTF16Of(ITOVString* s) { return ViewOf<char16_t>(s, &ITOVString::GetUTF16String); }
std::u32string UTF32Of(ITOVString* s) { return ViewOf<char32_t>(s, &ITOVString::GetUTF32String); }

std::u32string WideOf(ITOVString* s) {
    wchar_t* p = nullptr;
    EXPECT_EQ(s->GetWCHARString(&p), TOV_OK);
    return std::u32string(p, p + std::wcslen(p));
}

// Named after its subject; the component itself is ::HostString. Every case must leave no string alive.
class HostString : public testing::Test {
protected:
    void SetUp() override { m_Active = CTOVUnknown::GetActiveObjectCount(); }
    void TearDown() override { EXPECT_EQ(CTOVUnknown::GetActiveObjectCount(), m_Active); }

private:
    int32_t m_Active = 0;
};

TEST_F(HostString, ConvertsBetweenEveryEncodingAndForm) {
    struct Counts {
        uint32_t units, bytes;
    };
    const Counts counts[] = {{10, 10}, {5, 10}, {4, 16}, {4, 16}};  // in the order of kTypes
    for (int form = 0; form < kForms; ++form) {
        for (_tovUnicodeType stored : kTypes) {
            SCOPED_TRACE(testing::Message() << "form " << form << ", stored " << stored);
            TOVPtr<ITOVString> s = NewString(kTOVUnicodeUTF8, U"old");
            ASSERT_EQ(InForm(form, kMixed, [&](auto p, unsigned int n) { return s->Assign(stored, p, n); }), TOV_OK);
            // Counted before anything reads the text back (UTF-8 input is kept as it came).
            EXPECT_EQ(s->GetCodePointCount(), counts[stored - 1].units);
            EXPECT_EQ(s->GetByteCount(), counts[stored - 1].bytes);
            EXPECT_EQ(s->GetNumCharacters(), 4u);
            for (_tovUnicodeType target : kTypes) {
                ASSERT_EQ(s->ConvertTo(target), TOV_OK);
                EXPECT_EQ(s->GetUnicodeType(), target);
                EXPECT_EQ(UTF8Of(s.Get()), kMixedUTF8);
                EXPECT_EQ(UTF16Of(s.Get()), u"Aé€😀");
                EXPECT_EQ(UTF32Of(s.Get()), kMixed);
                EXPECT_EQ(WideOf(s.Get()), kMixed);
                EXPECT_EQ(s->GetCodePointCount(), counts[target - 1].units);
                EXPECT_EQ(s->GetByteCount(), counts[target - 1].bytes);
                EXPECT_EQ(s->GetNumCharacters(), 4u);
                EXPECT_EQ(s->GetUnicodeType(), target);  // the views did not convert the string
            }
        }
    }
}

TEST_F(HostString, InputEndsAtTheFirstZeroWithinN) {
    struct Case {
        const char* text;
        unsigned int n;
        const char* expected;
    };
    const Case cases[] = {
        {"abc", 3, "abc"}, {"abc", 4, "abc"}, {"abc", 2, "ab"}, {"ab\0cd", 5, "ab"},
        {"abc", 0, ""},    {nullptr, 0, ""},  {nullptr, 1, ""},
    };
    TOVPtr<ITOVString> s = NewString(kTOVUnicodeUTF8, U"old");
    for (const Case& c : cases) {
        SCOPED_TRACE(c.expected);
        ASSERT_EQ(s->Assign(kTOVUnicodeUTF16, Bytes(c.text), c.n), TOV_OK);
        EXPECT_EQ(UTF8Of(s.Get()), c.expected);
        EXPECT_EQ(s->GetCodePointCount(), std::strlen(c.expected));
    }
    const unsigned short wideZeros[] = {0x41, 0, 0};
    ASSERT_EQ(s->Assign(kTOVUnicodeUTF16, wideZeros, 3), TOV_OK);
    EXPECT_EQ(UTF8Of(s.Get()), "A");
}

TEST_F(HostString, RefusesMalformedInputNullPointersAndUnusableBuffersAndKeepsTheText) {
    unsigned char noTerminator[4] = {'a', 'b', 'c', 'd'}, malformed[4] = {0xC3, 0, 0, 0}, good[4] = {'a', 0, 0, 0};
    unsigned char oddSize[3] = {'a', 0, 0};  // a UTF-16 terminator needs two bytes
    unsigned char byte = 0;
    unsigned int size = 1;
    int position = 0;
    const unsigned short loneHigh[] = {0x41, 0xD83D}, loneLow[] = {0xDE00, 0x41};
    const unsigned int tooLarge[] = {0x110000}, surrogate[] = {0xDC00};
    const wchar_t wideSurrogate[] = {L'a', static_cast<wchar_t>(0xD800)};
    struct Case {
        const char* name;
        std::function<TOVRESULT(ITOVString*)> op;
    };
    const Case cases[] = {
        {"overlong UTF-8", [](ITOVString* s) { return s->Assign(kTOVUnicodeUTF8, Bytes("\xC0\x80"), 2); }},
        {"0xF5 in UTF-8", [](ITOVString* s) { return s->Append(Bytes("\xF5\x80\x80\x80"), 4); }},
        {"lone high surrogate", [&](ITOVString* s) { return s->Assign(kTOVUnicodeUTF8, loneHigh, 2); }},
        {"lone low surrogate", [&](ITOVString* s) { return s->Append(loneLow, 2); }},
        {"above 0x10FFFF", [&](ITOVString* s) { return s->Assign(kTOVUnicodeUTF32, tooLarge, 1); }},
        {"UTF-32 surrogate", [&](ITOVString* s) { return s->Append(surrogate, 1); }},
        {"wide surrogate", [&](ITOVString* s) { return s->Assign(kTOVUnicodeWCHAR, wideSurrogate, 2); }},
        {"null text with n 2",
         [](ITOVString* s) { return s->Assign(kTOVUnicodeUTF8, static_cast<const wchar_t*>(nullptr), 2); }},
        {"unknown type 0", [](ITOVString* s) { return s->Assign(static_cast<_tovUnicodeType>(0), L"x", 1); }},
        {"unknown type 5", [](ITOVString* s) { return s->ConvertTo(static_cast<_tovUnicodeType>(5)); }},
        {"null source", [](ITOVString* s) { return s->Assign(kTOVUnicodeUTF8, static_cast<ITOVString*>(nullptr)); }},
        {"set a partial character", [](ITOVString* s) { return s->SetCharacter(1, Bytes("\xC3"), 1); }},
        {"set two characters", [](ITOVString* s) { return s->SetCharacter(1, Bytes("ab"), 2); }},
        {"set a lone surrogate", [&](ITOVString* s) { return s->SetCharacter(1, loneLow, 1); }},
        {"set a surrogate value", [](ITOVString* s) { return s->SetCharacter(1, 0xD800u); }},
        {"set U+0000", [](ITOVString* s) { return s->SetCharacter(1, 0u); }},
        {"UTF-8 view", [&](ITOVString* s) { return s->GetUTF8String(nullptr); }},
        {"UTF-16 view", [&](ITOVString* s) { return s->GetUTF16String(nullptr); }},
        {"UTF-32 view", [&](ITOVString* s) { return s->GetUTF32String(nullptr); }},
        {"wide view", [&](ITOVString* s) { return s->GetWCHARString(nullptr); }},
        {"find position", [&](ITOVString* s) { return s->FindString(L"a", 1, 0, nullptr); }},
        {"reverse position", [&](ITOVString* s) { return s->FindStringReverse(Bytes("a"), 1, 0, nullptr); }},
        {"find in null", [&](ITOVString* s) { return s->FindString(static_cast<ITOVString*>(nullptr), 0, &position); }},
        {"append null", [&](ITOVString* s) { return s->Append(static_cast<ITOVString*>(nullptr)); }},
        {"compare null", [&](ITOVString* s) { return s->Compare(static_cast<ITOVString*>(nullptr), &position, 1); }},
        {"character into null",
         [&](ITOVString* s) { return s->GetCharacter(0, static_cast<unsigned char*>(nullptr), &size); }},
        {"character size null", [&](ITOVString* s) { return s->GetCharacter(0, &byte, nullptr); }},
        {"compare result", [&](ITOVString* s) { return s->Compare(L"a", 1, nullptr, 1); }},
        {"compare string result", [&](ITOVString* s) { return s->Compare(s, nullptr, 0); }},
        {"copy into null", [&](ITOVString* s) { return s->ConvertedCopy(kTOVUnicodeUTF8, nullptr); }},
        {"buffer handed back into null", [&](ITOVString* s) { return s->RemoveExternalBuffer(nullptr); }},
        {"query into null", [&](ITOVString* s) { return s->QueryInterface(IID_ITOVString, nullptr); }},
        {"null buffer", [](ITOVString* s) { return s->SetExternalBuffer(kTOVUnicodeUTF8, nullptr, 8); }},
        {"buffer of unknown type",
         [&](ITOVString* s) { return s->SetExternalBuffer(static_cast<_tovUnicodeType>(9), good, sizeof good); }},
        {"buffer without terminator",
         [&](ITOVString* s) { return s->SetExternalBuffer(kTOVUnicodeUTF8, noTerminator, 4); }},
        {"malformed buffer", [&](ITOVString* s) { return s->SetExternalBuffer(kTOVUnicodeUTF8, malformed, 4); }},
        {"no terminator in units", [&](ITOVString* s) { return s->SetExternalBuffer(kTOVUnicodeUTF16, oddSize, 3); }},
        {"no terminator for UTF-32", [&](ITOVString* s) { return s->SetExternalBuffer(kTOVUnicodeUTF32, good, 3); }},
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(c.name);
        TOVPtr<ITOVString> s = NewString(kTOVUnicodeUTF16, kMixed);
        EXPECT_EQ(c.op(s.Get()), TOV_E_INVALIDARG);
        EXPECT_EQ(WideOf(s.Get()), kMixed);
        EXPECT_EQ(s->GetUnicodeType(), kTOVUnicodeUTF16);
    }
}

TEST_F(HostString, ViewsStayPutWhileTheTextStays) {
    // Long enough to live on the heap in every form.
    TOVPtr<ITOVString> s = NewString(kTOVUnicodeUTF16, kMixed + kMixed + kMixed + kMixed);
    const unsigned char *utf8 = nullptr, *utf8Again = nullptr;
    const unsigned short *utf16 = nullptr, *utf16Again = nullptr;
    ASSERT_EQ(s->GetUTF8String(&utf8), TOV_OK);
    ASSERT_EQ(s->GetUTF16String(&utf16), TOV_OK);
    ASSERT_EQ(s->ConvertTo(kTOVUnicodeUTF8), TOV_OK);  // the encoding, not the text
    ASSERT_EQ(s->GetUTF8String(&utf8Again), TOV_OK);
    ASSERT_EQ(s->GetUTF16String(&utf16Again), TOV_OK);
    EXPECT_EQ(utf8Again, utf8);
    EXPECT_EQ(utf16Again, utf16);
}

TEST_F(HostString, WideStorageCanBeRewrittenInPlace) {
    TOVPtr<ITOVString> s = NewString(kTOVUnicodeWCHAR, kMixed);
    wchar_t* wide = nullptr;
    ASSERT_EQ(s->GetWCHARString(&wide), TOV_OK);
    wide[0] = L'B';
    EXPECT_EQ(UTF8Of(s.Get()), u8"Bé€😀");
    wide[1] = static_cast<wchar_t>(0xD800);  // no scalar value: reads as U+FFFD
    EXPECT_EQ(UTF16Of(s.Get()), u"B\uFFFD€😀");
    EXPECT_EQ(s->GetNumCharacters(), 4u);
    unsigned int cp = 0;
    EXPECT_EQ(s->GetCharacter(1, &cp), TOV_OK);
    EXPECT_EQ(cp, 0xFFFDu);
    // Converting stores what the views read, and counts follow the new encoding.
    ASSERT_EQ(s->ConvertTo(kTOVUnicodeUTF8), TOV_OK);
    EXPECT_EQ(WideOf(s.Get()), U"B�€😀");
    EXPECT_EQ(s->GetCodePointCount(), 1u + 3 + 3 + 4);
}

int Sign(int value) { return (value > 0) - (value < 0); }

TEST_F(HostString, ComparesByCodePointWithOrWithoutCase) {
    struct Case {
        std::u32string left, right;
        int caseSensitive, expected;
    };
    const Case cases[] = {
        {U"abc", U"abc", 1, 0},        {U"abc", U"ABC", 1, 1}, {U"abc", U"ABC", 0, 0}, {U"abc", U"abd", 0, -1},
        {U"ab", U"abc", 1, -1},        {U"", U"", 1, 0},       {U"", U"a", 0, -1},     {U"Été", U"été", 1, -1},
        {U"Été", U"éTÉ", 0, 0},        {U"ÉA", U"éb", 0, -1},  {U"ΣΑΣ", U"σας", 0, 0}, {U"ΣΑΣ", U"σας", 1, -1},
        {U"😀", U"\uFFFF", 1, 1},        // code-point order, not UTF-16 unit order
        {U"straße", U"STRASSE", 0, 1},  // simple folding keeps ß one letter
    };
    for (const Case& c : cases) {
        for (_tovUnicodeType stored : {kTOVUnicodeUTF8, kTOVUnicodeUTF16}) {
            TOVPtr<ITOVString> left = NewString(stored, c.left);
            for (int form = 0; form < kForms; ++form) {
                SCOPED_TRACE(testing::Message()
                             << UnicodeCodec::EncodeUTF8(c.left) << " vs " << UnicodeCodec::EncodeUTF8(c.right)
                             << ", case " << c.caseSensitive << ", form " << form);
                int result = 99;
                ASSERT_EQ(InForm(form, c.right,
                                 [&](auto p, unsigned int n) { return left->Compare(p, n, &result, c.caseSensitive); }),
                          TOV_OK);
                EXPECT_EQ(Sign(result), c.expected);
            }
            int result = 99;
            TOVPtr<ITOVString> right = NewString(kTOVUnicodeUTF32, c.right);
            ASSERT_EQ(left->Compare(right.Get(), &result, c.caseSensitive), TOV_OK);
            EXPECT_EQ(Sign(result), c.expected);
        }
    }
}

TEST_F(HostString, ChangesCaseOfEveryLetterItKnows) {
    TOVPtr<ITOVString> s = NewString(kTOVUnicodeUTF16, U"Aé€😀Éσ");
    ASSERT_EQ(s->ToUpper(), TOV_OK);
    EXPECT_EQ(WideOf(s.Get()), U"AÉ€😀ÉΣ");
    ASSERT_EQ(s->ToLower(), TOV_OK);
    EXPECT_EQ(WideOf(s.Get()), U"aé€😀éσ");
    EXPECT_EQ(s->GetUnicodeType(), kTOVUnicodeUTF16);
}

TEST_F(HostString, FindsByCharacterIndexForwardAndBackward) {
    const std::u32string haystack = U"é😀abcé😀abc";  // 10 characters, "abc" at 2 and 7
    struct Case {
        std::u32string needle;
        int start, forward, reverse;
    };
    const Case cases[] = {
        {U"abc", 0, 2, -1},  {U"abc", 2, 2, 2},   {U"abc", 3, 7, 2},
        {U"abc", 7, 7, 7},   {U"abc", 8, -1, 7},  {U"abc", 10, -1, 7},
        {U"abc", 11, -1, 7}, {U"abc", -3, 2, 7},  {U"😀a", 0, 1, -1},
        {U"😀a", 6, 6, 6},    {U"é", 4, 5, 0},     {U"xyz", 0, -1, -1},
        {U"", 4, 4, 4},      {U"", 10, 10, 10},   {U"", 11, -1, 10},
        {U"", -1, 0, 10},    {haystack, 0, 0, 0}, {haystack + U"!", 0, -1, -1},
    };
    for (_tovUnicodeType stored : kTypes) {
        TOVPtr<ITOVString> s = NewString(stored, haystack);
        for (const Case& c : cases) {
            for (int form = 0; form <= kForms; ++form) {
                SCOPED_TRACE(testing::Message() << UnicodeCodec::EncodeUTF8(c.needle) << " from " << c.start
                                                << ", stored " << stored << ", form " << form);
                int forward = 99, reverse = 99;
                // Both directions through one overload; the last form is the needle as a string.
                auto find = [&](auto needle, auto... n) {
                    const TOVRESULT result = s->FindString(needle, n..., c.start, &forward);
                    return result < 0 ? result : s->FindStringReverse(needle, n..., c.start, &reverse);
                };
                ASSERT_EQ(
                    form == kForms ? find(NewString(kTOVUnicodeUTF8, c.needle).Get()) : InForm(form, c.needle, find),
                    TOV_OK);
                EXPECT_EQ(forward, c.forward);
                EXPECT_EQ(reverse, c.reverse);
            }
        }
    }
}

TEST_F(HostString, ReadsOneCharacterInEachForm) {
    const struct {
        unsigned int index;
        std::string utf8;
        std::vector<unsigned short> utf16;
    } cases[] = {{0, "A", {0x41}}, {1, u8"é", {0xE9}}, {2, u8"€", {0x20AC}}, {3, u8"😀", {0xD83D, 0xDE00}}};
    for (_tovUnicodeType stored : kTypes) {
        TOVPtr<ITOVString> s = NewString(stored, kMixed);
        unsigned char bytes[4];
        unsigned short units[2];
        unsigned int size = 0, cp = 0;
        for (const auto& c : cases) {
            SCOPED_TRACE(testing::Message() << "stored " << stored << ", index " << c.index);
            size = sizeof bytes;
            ASSERT_EQ(s->GetCharacter(c.index, bytes, &size), TOV_OK);
            EXPECT_EQ(std::string(bytes, bytes + size), c.utf8);
            size = 2;
            ASSERT_EQ(s->GetCharacter(c.index, units, &size), TOV_OK);
            EXPECT_EQ(std::vector<unsigned short>(units, units + size), c.utf16);
            ASSERT_EQ(s->GetCharacter(c.index, &cp), TOV_OK);
            EXPECT_EQ(cp, kMixed[c.index]);

            // One unit short: refused, with the units needed.
            size = static_cast<unsigned int>(c.utf8.size()) - 1;
            EXPECT_EQ(s->GetCharacter(c.index, bytes, &size), TOV_E_INVALIDARG);
            EXPECT_EQ(size, c.utf8.size());
            size = static_cast<unsigned int>(c.utf16.size()) - 1;
            EXPECT_EQ(s->GetCharacter(c.index, units, &size), TOV_E_INVALIDARG);
            EXPECT_EQ(size, c.utf16.size());
        }
        size = sizeof bytes;
        EXPECT_EQ(s->GetCharacter(4, bytes, &size), TOV_E_OUTOFRANGE);
        size = 2;
        EXPECT_EQ(s->GetCharacter(4, units, &size), TOV_E_OUTOFRANGE);
        EXPECT_EQ(s->GetCharacter(4, &cp), TOV_E_OUTOFRANGE);
    }
}

TEST_F(HostString, ReplacesOneCharacterInEachForm) {
    TOVPtr<ITOVString> s = NewString(kTOVUnicodeUTF8, kMixed);
    ASSERT_EQ(s->SetCharacter(0, Bytes(u8"😀"), 4), TOV_OK);
    const unsigned short euro[] = {0x20AC, 0};
    ASSERT_EQ(s->SetCharacter(3, euro, 2), TOV_OK);  // a terminator within size is not text
    ASSERT_EQ(s->SetCharacter(1, 0x10FFFFu), TOV_OK);
    EXPECT_EQ(WideOf(s.Get()), U"😀\U0010FFFF€€");
    EXPECT_EQ(s->GetByteCount(), 4u + 4 + 3 + 3);

    EXPECT_EQ(s->SetCharacter(4, Bytes("A"), 1), TOV_E_OUTOFRANGE);
    EXPECT_EQ(WideOf(s.Get()), U"😀\U0010FFFF€€");
}

TEST_F(HostString, TruncateKeepsTheFirstCharacters) {
    const struct {
        unsigned int count;
        std::u32string expected;
    } cases[] = {{0, U""}, {2, U"Aé"}, {3, U"Aé€"}, {4, kMixed}, {100, kMixed}};
    for (const auto& c : cases) {
        SCOPED_TRACE(c.count);
        TOVPtr<ITOVString> s = NewString(kTOVUnicodeUTF16, kMixed);
        ASSERT_EQ(s->Truncate(c.count), TOV_OK);
        EXPECT_EQ(WideOf(s.Get()), c.expected);
        EXPECT_EQ(s->GetNumCharacters(), c.expected.size());
        EXPECT_EQ(s->IsEmpty(), c.expected.empty() ? 1 : 0);
    }
}

TEST_F(HostString, AppendsAndAssignsInTheStoredEncoding) {
    TOVPtr<ITOVString> s = NewString(kTOVUnicodeUTF16, U"Aé");
    ASSERT_EQ(s->Append(Bytes(u8"€"), 3), TOV_OK);
    ASSERT_EQ(s->Append(L"😀", 1), TOV_OK);
    ASSERT_EQ(s->Append(static_cast<const unsigned int*>(nullptr), 1), TOV_OK);
    ASSERT_EQ(s->Append(s.Get()), TOV_OK);  // itself
    EXPECT_EQ(WideOf(s.Get()), kMixed + kMixed);
    EXPECT_EQ(s->GetUnicodeType(), kTOVUnicodeUTF16);
    EXPECT_EQ(s->GetCodePointCount(), 10u);

    TOVPtr<ITOVString> other = NewString(kTOVUnicodeUTF8, U"");
    ASSERT_EQ(other->Assign(kTOVUnicodeUTF8, Bytes(u8"ü"), 2), TOV_OK);  // kept as UTF-8, and copied so
    ASSERT_EQ(s->Assign(kTOVUnicodeUTF32, other.Get()), TOV_OK);
    EXPECT_EQ(s->GetUnicodeType(), kTOVUnicodeUTF32);
    ASSERT_EQ(s->Assign(kTOVUnicodeUTF8, s.Get()), TOV_OK);
    EXPECT_EQ(s->GetByteCount(), 2u);
    EXPECT_EQ(WideOf(s.Get()), U"ü");
    EXPECT_EQ(WideOf(other.Get()), U"ü");

    ASSERT_EQ(s->Clear(), TOV_OK);
    EXPECT_EQ(s->IsEmpty(), 1);
    EXPECT_EQ(UTF8Of(s.Get()), "");
    EXPECT_EQ(s->GetUnicodeType(), kTOVUnicodeUTF8);
}

TEST_F(HostString, ConvertedCopyIsAnIndependentString) {
    TOVPtr<ITOVString> s = NewString(kTOVUnicodeUTF8, U"");
    ASSERT_EQ(s->Assign(kTOVUnicodeUTF8, Bytes(kMixedUTF8), sizeof kMixedUTF8), TOV_OK);
    TOVPtr<ITOVString> copy;
    ASSERT_EQ(s->ConvertedCopy(kTOVUnicodeUTF16, copy.OutT()), TOV_OK);
    EXPECT_NE(copy.Get(), s.Get());
    EXPECT_EQ(copy->GetUnicodeType(), kTOVUnicodeUTF16);
    EXPECT_EQ(s->GetUnicodeType(), kTOVUnicodeUTF8);
    ASSERT_EQ(s->Truncate(1), TOV_OK);
    EXPECT_EQ(WideOf(copy.Get()), kMixed);
    EXPECT_EQ(copy->GetByteCount(), 10u);

    ITOVString* none = s.Get();
    EXPECT_EQ(s->ConvertedCopy(static_cast<_tovUnicodeType>(7), &none), TOV_E_INVALIDARG);
    EXPECT_EQ(none, nullptr);
    EXPECT_EQ(copy.Detach()->Release(), 0u);  // the copy came with exactly one reference
}

TEST_F(HostString, KeepsItsTextInAnExternalBufferWhileItFits) {
    unsigned char buffer[8];
    std::memcpy(buffer, "abc\0zzzz", 8);
    TOVPtr<ITOVString> s = NewString(kTOVUnicodeWCHAR, U"old");
    ASSERT_EQ(s->SetExternalBuffer(kTOVUnicodeUTF8, buffer, sizeof buffer), TOV_OK);
    EXPECT_EQ(s->SetExternalBuffer(kTOVUnicodeUTF8, buffer, sizeof buffer), ZEB_E_ALREADYSET);
    EXPECT_EQ(UTF8Of(s.Get()), "abc");
    EXPECT_EQ(s->GetUnicodeType(), kTOVUnicodeUTF8);
    const unsigned char* view = nullptr;
    ASSERT_EQ(s->GetUTF8String(&view), TOV_OK);
    EXPECT_EQ(view, buffer);  // UTF-8 is read where it stands, not copied

    ASSERT_EQ(s->Append(Bytes(u8"dé"), 3), TOV_OK);  // 7 bytes with the terminator
    EXPECT_STREQ(reinterpret_cast<char*>(buffer), u8"abcdé");
    EXPECT_EQ(s->Append(Bytes("fg"), 2), TOV_E_OUTOFRANGE);       // 9 bytes
    EXPECT_EQ(s->ConvertTo(kTOVUnicodeUTF16), TOV_E_OUTOFRANGE);  // 12 bytes
    EXPECT_STREQ(reinterpret_cast<char*>(buffer), u8"abcdé");
    EXPECT_EQ(UTF8Of(s.Get()), u8"abcdé");
    EXPECT_EQ(s->GetUnicodeType(), kTOVUnicodeUTF8);

    ASSERT_EQ(s->SetCharacter(4, 0x45u), TOV_OK);
    ASSERT_EQ(s->ToUpper(), TOV_OK);
    EXPECT_STREQ(reinterpret_cast<char*>(buffer), "ABCDE");
    ASSERT_EQ(s->Truncate(2), TOV_OK);
    ASSERT_EQ(s->ConvertTo(kTOVUnicodeUTF16), TOV_OK);  // the buffer follows the stored encoding
    const unsigned char utf16[] = {'A', 0, 'B', 0, 0, 0};
    EXPECT_EQ(std::memcmp(buffer, utf16, sizeof utf16), 0);

    unsigned char* handedBack = nullptr;
    ASSERT_EQ(s->RemoveExternalBuffer(&handedBack), TOV_OK);
    EXPECT_EQ(handedBack, buffer);
    ASSERT_EQ(s->Append(Bytes("CDEFGHIJ"), 8), TOV_OK);  // no longer bound by the buffer
    EXPECT_EQ(UTF8Of(s.Get()), "ABCDEFGHIJ");
    EXPECT_EQ(std::memcmp(buffer, utf16, sizeof utf16), 0);
    EXPECT_EQ(s->RemoveExternalBuffer(&handedBack), ZEB_E_NOTREADY);
    EXPECT_EQ(handedBack, nullptr);

    // Removed before any change, the buffer leaves its text with the string.
    std::memcpy(buffer, "xyz", 4);
    ASSERT_EQ(s->SetExternalBuffer(kTOVUnicodeUTF8, buffer, sizeof buffer), TOV_OK);
    ASSERT_EQ(s->RemoveExternalBuffer(&handedBack), TOV_OK);
    buffer[0] = 'X';
    EXPECT_EQ(UTF8Of(s.Get()), "xyz");
}

TEST_F(HostString, ExternalTextNeedsNoAlignmentAndMayNotGrowPastTheBuffer) {
    // U+0250's upper case U+2C6F is one UTF-16 unit too, so it is written in place.
    alignas(4) unsigned char raw[7] = {};
    unsigned char* unaligned = raw + 1;
    const unsigned short text[] = {0x0250, 0x41, 0};
    std::memcpy(unaligned, text, sizeof text);
    TOVPtr<ITOVString> wide = NewString(kTOVUnicodeUTF8, U"");
    ASSERT_EQ(wide->SetExternalBuffer(kTOVUnicodeUTF16, unaligned, sizeof text), TOV_OK);
    EXPECT_EQ(WideOf(wide.Get()), U"\u0250A");
    ASSERT_EQ(wide->ToUpper(), TOV_OK);
    unsigned short units[3] = {};
    std::memcpy(units, unaligned, sizeof units);
    EXPECT_EQ(std::vector<unsigned short>(units, units + 3), (std::vector<unsigned short>{0x2C6F, 0x41, 0}));
    EXPECT_EQ(wide->Append(L"b", 1), TOV_E_OUTOFRANGE);

    unsigned char utf32[8] = {0x00, 0xF6, 0x01};  // U+1F600 and a terminator, little-endian
    ASSERT_EQ(wide->RemoveExternalBuffer(&unaligned), TOV_OK);
    ASSERT_EQ(wide->SetExternalBuffer(kTOVUnicodeUTF32, utf32, sizeof utf32), TOV_OK);
    EXPECT_EQ(WideOf(wide.Get()), U"😀");
}

}  // namespace
