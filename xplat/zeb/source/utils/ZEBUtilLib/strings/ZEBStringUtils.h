#pragma once
/// Free functions over ZEBString: substrings, prefix, suffix and pattern tests,
/// converted copies, and the pieces of a path.
///
/// Each works on a private wide copy of its arguments, so one unit is one
/// character and indexes are character indexes. Slash and backslash are both
/// path separators. Every empty result is made from kEmptyStr16 (UTF-16);
/// other built results stand in UTF-32 unless a function says otherwise.
/// Failures are those of ZEBString: a thrown `int`.
#include "strings/ZEBString.h"

namespace ZEB {
namespace ZEBStringUtils {

/// `count` characters from `start`; a negative count, or one that runs past
/// the end, takes the rest. A start at or past the end gives the empty string.
ZEBString GetSubString(const ZEBString& s, unsigned int start, int count);

/// A string from the text in its own encoding (wide text in encoding 4),
/// cut to its first `count` characters unless `count` is negative.
ZEBString CreateZEBString(const unsigned char* text, int count);
ZEBString CreateZEBString(const unsigned short* text, int count);
ZEBString CreateZEBString(const unsigned int* text, int count);
ZEBString CreateWCharZEBString(const wchar_t* text, int count);

/// Prefix and suffix tests that always let ASCII letters match in either case
/// and compare every other character exactly. The last argument is accepted
/// for the callers' sake and ignored. An empty pattern matches.
bool IsStartWith(const ZEBString& s, const ZEBString& pattern, int ignored);
bool IsStartWith(const ZEBString& s, const unsigned char* pattern, int ignored);
bool IsStartWith(const ZEBString& s, const unsigned short* pattern, int ignored);
bool IsStartWith(const ZEBString& s, const unsigned int* pattern, int ignored);
bool IsStartWithWChar(const ZEBString& s, const wchar_t* pattern, int ignored);
bool IsEndWith(const ZEBString& s, const ZEBString& pattern, int ignored);
bool IsEndWith(const ZEBString& s, const unsigned char* pattern, int ignored);
bool IsEndWith(const ZEBString& s, const unsigned short* pattern, int ignored);
bool IsEndWith(const ZEBString& s, const unsigned int* pattern, int ignored);
bool IsEndWithWChar(const ZEBString& s, const wchar_t* pattern, int ignored);

/// Equal characters; with `ignoreCase` set, also two ASCII letters that differ
/// only in case.
bool IsSameChar(wchar_t a, wchar_t b, int ignoreCase);

/// Same length in characters, and position by position equal as by
/// IsSameChar, where "?" in the pattern matches any character.
bool FixLengthPatternMatch(const ZEBString& s, const ZEBString& pattern, int ignoreCase);
bool FixLengthPatternMatch(const ZEBString& s, const unsigned char* pattern, int ignoreCase);
bool FixLengthPatternMatch(const ZEBString& s, const unsigned short* pattern, int ignoreCase);
bool FixLengthPatternMatch(const ZEBString& s, const unsigned int* pattern, int ignoreCase);
bool FixLengthPatternMatchWChar(const ZEBString& s, const wchar_t* pattern, int ignoreCase);

/// A copy converted to encoding 1, 2, 3 or 4.
ZEBString GetUTF8ZEBString(const ZEBString& s);
ZEBString GetUTF16ZEBString(const ZEBString& s);
ZEBString GetUTF32ZEBString(const ZEBString& s);
ZEBString GetWCharZEBString(const ZEBString& s);

/// The path scans below never look at index 0, so a separator there does not
/// split and a dot there does not start an extension.
///
/// The text behind the last separator; the whole path when it has none (the
/// empty path gives the empty string); empty when the path ends with one.
ZEBString GetFileName(const ZEBString& path);
/// The text behind the file name's last dot, or with `withDot` set from the
/// dot on; empty when the name has no dot.
ZEBString GetExtName(const ZEBString& path, int withDot);
/// The text up to and including the last separator; empty when there is none.
ZEBString GetParentFolder(const ZEBString& path);
/// The file name up to its last dot. A name without such a dot gives a copy of
/// the whole `path`, folders included, in its own encoding.
ZEBString GetFileCaption(const ZEBString& path);
/// A wide (encoding 4) copy with every backslash made a slash.
ZEBString StandardizePath(const ZEBString& path);
/// `base`, a slash unless `base` is empty or ends with a separator, then
/// `relative` less one leading separator; backslashes become slashes.
ZEBString CombinePath(const ZEBString& base, const ZEBString& relative);

}  // namespace ZEBStringUtils
}  // namespace ZEB
