#include "strings/ZEBStringUtils.h"

#include <cwchar>
#include <string>
#include <vector>

#include "strings/tovUTF16LiteralToUTF16.h"
#include "tov/sdk/TOVFailureStyle.h"

namespace ZEB {
namespace ZEBStringUtils {

namespace {

static_assert(sizeof(wchar_t) == sizeof(unsigned int), "wide text is handled as 32-bit units");

ZEBString Empty() { return ZEBString(static_cast<const unsigned short*>(kEmptyStr16)); }

// The private copy every function works on: converted to wide, one unit per character.
std::wstring WideText(const ZEBString& s) {
    ZEBString copy(s);
    copy.ConvertTo(kTOVUnicodeWCHAR);
    return std::wstring(copy.GetWCHARString(), copy.GetNumCharacters());
}

template <class Unit>
std::wstring WideText(const Unit* text) {
    return WideText(ZEBString(text));
}

std::wstring WideText(const wchar_t* text) { return text ? std::wstring(text) : std::wstring(); }

// A new string from wide text, in encoding 3 or 4 (both take 32-bit units).
ZEBString FromWide(const std::wstring& text, _tovUnicodeType type = kTOVUnicodeUTF32) {
    if (text.empty()) return Empty();
    std::vector<unsigned int> units(text.begin(), text.end());
    units.push_back(0);
    ZEBString result;
    result.Assign(type, units.data(), static_cast<unsigned int>(units.size()));
    return result;
}

ZEBString ConvertedCopy(const ZEBString& s, _tovUnicodeType type) {
    ZEBString result;
    TOVCheck(s.InArg()->ConvertedCopy(type, result.OutArg()));
    return result;
}

ZEBString CutToCount(const ZEBString& whole, int count) {
    if (count < 0) return whole;
    return GetSubString(whole, 0, count);
}

bool StartsWith(const std::wstring& s, const std::wstring& pattern) {
    if (s.size() < pattern.size()) return false;
    for (std::size_t i = 0; i < pattern.size(); ++i) {
        if (!IsSameChar(s[i], pattern[i], 1)) return false;
    }
    return true;
}

bool EndsWith(const std::wstring& s, const std::wstring& pattern) {
    if (s.size() < pattern.size()) return false;
    const std::size_t offset = s.size() - pattern.size();
    for (std::size_t i = pattern.size(); i-- > 0;) {
        if (!IsSameChar(s[offset + i], pattern[i], 1)) return false;
    }
    return true;
}

bool MatchesPattern(const std::wstring& s, const std::wstring& pattern, int ignoreCase) {
    if (s.size() != pattern.size()) return false;
    for (std::size_t i = 0; i < s.size(); ++i) {
        if (pattern[i] != L'?' && !IsSameChar(s[i], pattern[i], ignoreCase)) return false;
    }
    return true;
}

bool IsSeparator(wchar_t c) { return c == L'/' || c == L'\\'; }

bool IsDot(wchar_t c) { return c == L'.'; }

// The last index from 1 on whose character `match` accepts, or 0 for none:
// the scans stop before index 0, which is never examined.
template <class Match>
std::size_t LastIndexAfterFirst(const std::wstring& text, Match match) {
    for (std::size_t p = text.size(); p-- > 1;) {
        if (match(text[p])) return p;
    }
    return 0;
}

std::wstring FileNameText(const std::wstring& path) {
    const std::size_t separator = LastIndexAfterFirst(path, IsSeparator);
    return separator == 0 ? path : path.substr(separator + 1);
}

void SlashBackslashes(wchar_t* text, std::size_t size) {
    for (std::size_t i = 0; i < size; ++i) {
        if (text[i] == L'\\') text[i] = L'/';
    }
}

}  // namespace

ZEBString GetSubString(const ZEBString& s, unsigned int start, int count) {
    if (count == 0) return Empty();
    const uint32_t size = s.GetNumCharacters();
    // Measured in 64 bits, so a large count cannot wrap around below the size.
    const bool toEnd = count < 0 || static_cast<uint64_t>(count) + start > size;
    // A start past the end makes the unsigned difference wrap to a negative
    // length; one far past it can wrap to a positive one, hence the test of start.
    const int length = toEnd ? static_cast<int>(size - start) : count;
    if (length <= 0 || start >= size) return Empty();
    return FromWide(WideText(s).substr(start, static_cast<std::size_t>(length)));
}

ZEBString CreateZEBString(const unsigned char* text, int count) { return CutToCount(ZEBString(text), count); }

ZEBString CreateZEBString(const unsigned short* text, int count) { return CutToCount(ZEBString(text), count); }

ZEBString CreateZEBString(const unsigned int* text, int count) { return CutToCount(ZEBString(text), count); }

ZEBString CreateWCharZEBString(const wchar_t* text, int count) {
    return CutToCount(FromWide(WideText(text), kTOVUnicodeWCHAR), count);
}

bool IsStartWith(const ZEBString& s, const ZEBString& pattern, int) {
    return StartsWith(WideText(s), WideText(pattern));
}

bool IsStartWith(const ZEBString& s, const unsigned char* pattern, int) {
    return StartsWith(WideText(s), WideText(pattern));
}

bool IsStartWith(const ZEBString& s, const unsigned short* pattern, int) {
    return StartsWith(WideText(s), WideText(pattern));
}

bool IsStartWith(const ZEBString& s, const unsigned int* pattern, int) {
    return StartsWith(WideText(s), WideText(pattern));
}

bool IsStartWithWChar(const ZEBString& s, const wchar_t* pattern, int) {
    return StartsWith(WideText(s), WideText(pattern));
}

bool IsEndWith(const ZEBString& s, const ZEBString& pattern, int) { return EndsWith(WideText(s), WideText(pattern)); }

bool IsEndWith(const ZEBString& s, const unsigned char* pattern, int) {
    return EndsWith(WideText(s), WideText(pattern));
}

bool IsEndWith(const ZEBString& s, const unsigned short* pattern, int) {
    return EndsWith(WideText(s), WideText(pattern));
}

bool IsEndWith(const ZEBString& s, const unsigned int* pattern, int) {
    return EndsWith(WideText(s), WideText(pattern));
}

bool IsEndWithWChar(const ZEBString& s, const wchar_t* pattern, int) {
    return EndsWith(WideText(s), WideText(pattern));
}

bool IsSameChar(wchar_t a, wchar_t b, int ignoreCase) {
    if (a == b) return true;
    if (!ignoreCase) return false;
    const auto isAsciiLetter = [](wchar_t c) { return (c >= L'A' && c <= L'Z') || (c >= L'a' && c <= L'z'); };
    // The two ASCII cases of a letter lie exactly 32 apart.
    return isAsciiLetter(a) && isAsciiLetter(b) && (a - b == 32 || b - a == 32);
}

bool FixLengthPatternMatch(const ZEBString& s, const ZEBString& pattern, int ignoreCase) {
    return MatchesPattern(WideText(s), WideText(pattern), ignoreCase);
}

bool FixLengthPatternMatch(const ZEBString& s, const unsigned char* pattern, int ignoreCase) {
    return MatchesPattern(WideText(s), WideText(pattern), ignoreCase);
}

bool FixLengthPatternMatch(const ZEBString& s, const unsigned short* pattern, int ignoreCase) {
    return MatchesPattern(WideText(s), WideText(pattern), ignoreCase);
}

bool FixLengthPatternMatch(const ZEBString& s, const unsigned int* pattern, int ignoreCase) {
    return MatchesPattern(WideText(s), WideText(pattern), ignoreCase);
}

bool FixLengthPatternMatchWChar(const ZEBString& s, const wchar_t* pattern, int ignoreCase) {
    return MatchesPattern(WideText(s), WideText(pattern), ignoreCase);
}

ZEBString GetUTF8ZEBString(const ZEBString& s) { return ConvertedCopy(s, kTOVUnicodeUTF8); }

ZEBString GetUTF16ZEBString(const ZEBString& s) { return ConvertedCopy(s, kTOVUnicodeUTF16); }

ZEBString GetUTF32ZEBString(const ZEBString& s) { return ConvertedCopy(s, kTOVUnicodeUTF32); }

ZEBString GetWCharZEBString(const ZEBString& s) { return ConvertedCopy(s, kTOVUnicodeWCHAR); }

ZEBString GetFileName(const ZEBString& path) { return FromWide(FileNameText(WideText(path))); }

ZEBString GetExtName(const ZEBString& path, int withDot) {
    const std::wstring name = FileNameText(WideText(path));
    const std::size_t dot = LastIndexAfterFirst(name, IsDot);
    if (dot == 0) return Empty();
    return FromWide(name.substr(withDot ? dot : dot + 1));
}

ZEBString GetParentFolder(const ZEBString& path) {
    const std::wstring text = WideText(path);
    const std::size_t separator = LastIndexAfterFirst(text, IsSeparator);
    if (separator == 0) return Empty();
    return FromWide(text.substr(0, separator + 1));
}

ZEBString GetFileCaption(const ZEBString& path) {
    const std::wstring name = FileNameText(WideText(path));
    if (name.empty()) return Empty();
    const std::size_t dot = LastIndexAfterFirst(name, IsDot);
    // Unlike GetExtName, a name without a dot from index 1 on gives the whole path.
    if (dot == 0) return ZEBString(path);
    return FromWide(name.substr(0, dot));
}

ZEBString StandardizePath(const ZEBString& path) {
    ZEBString result = GetWCharZEBString(path);
    // A wide string hands out its own storage, so the rewrite is in place.
    SlashBackslashes(result.GetWCHARString(), result.GetNumCharacters());
    return result;
}

ZEBString CombinePath(const ZEBString& base, const ZEBString& relative) {
    const std::wstring baseText = WideText(base);
    const std::wstring relativeText = WideText(relative);
    std::wstring combined;
    combined.reserve(baseText.size() + relativeText.size() + 2);
    combined = baseText;
    if (!baseText.empty() && !IsSeparator(baseText.back())) combined += L'/';
    const bool leadingSeparator = !relativeText.empty() && IsSeparator(relativeText.front());
    combined.append(relativeText, leadingSeparator ? 1 : 0, std::wstring::npos);
    SlashBackslashes(combined.data(), combined.size());
    return FromWide(combined);
}

}  // namespace ZEBStringUtils
}  // namespace ZEB
