#pragma once
/// The text type of every boundary: a value class over one host string
/// component. It keeps no text of its own; storage, conversion and comparison
/// are the component's.
///
/// Failures: every operation that calls the component throws its failing
/// result as a plain `int`; a call that needs a string while there is none,
/// or that must create one before the library is started, throws
/// ZEB_E_NOTREADY.
///
/// Raw text handed over without a count (constructors, `operator=`, `+=`,
/// `==`, `!=`, `<`, `>`) is passed with its terminator: length + 1 units, and
/// 1 for a null pointer, which goes on as null. `FindString` and
/// `FindStringReverse` pass the length without the terminator (0 for null).
/// The explicit forms pass the caller's count unchanged.
#include <cstdint>

#include "tov/ITOVString.h"

namespace ZEB {

class ZEBString {
public:
    /// No string; nothing is created until the first assignment.
    ZEBString();
    /// A new string holding the text in encoding 1, 2 or 3 respectively.
    ZEBString(const unsigned char* text);
    ZEBString(const unsigned short* text);
    ZEBString(const unsigned int* text);
    /// Shares `source` (one AddRef) when it already stands in `type`; otherwise
    /// a new string with its text in `type`.
    ZEBString(_tovUnicodeType type, ITOVString* source);
    /// Wraps `string` without AddRef. `release` 0 makes a view that never
    /// releases it; not 0 takes over the caller's reference.
    ZEBString(ITOVString* string, int release);
    /// A converted copy in the source's own encoding: the two never share text.
    ZEBString(const ZEBString& other);
    /// Takes over `other`'s string and release flag; `other` is left null.
    ZEBString(ZEBString&& other) noexcept;
    virtual ~ZEBString();

    /// A bare new string component; `*out` owns one reference.
    static void CreateString(ITOVString** out);

    /// The string for passing in; ownership stays here.
    ITOVString* InArg() const;
    /// Releases what is held, whatever the release flag, and hands out the
    /// pointer field for a call to fill. The string put there is owned here.
    ITOVString** OutArg();
    _tovUnicodeType GetUnicodeType() const;

    /// Assignment creates the string when there is none yet. On a view it
    /// writes through to the viewed string.
    ZEBString& operator=(const unsigned char* text);
    ZEBString& operator=(const unsigned short* text);
    ZEBString& operator=(const unsigned int* text);
    /// Takes the source's text in the source's own encoding.
    ZEBString& operator=(ITOVString* source);
    ZEBString& operator=(const ZEBString& other);
    void Assign(_tovUnicodeType type, const unsigned char* text, unsigned int n);
    void Assign(_tovUnicodeType type, const unsigned short* text, unsigned int n);
    void Assign(_tovUnicodeType type, const unsigned int* text, unsigned int n);
    void Assign(_tovUnicodeType type, ITOVString* source);

    /// Appending never creates the string.
    ZEBString& operator+=(const unsigned char* text);
    ZEBString& operator+=(const unsigned short* text);
    ZEBString& operator+=(const unsigned int* text);
    ZEBString& operator+=(ITOVString* text);
    ZEBString& operator+=(const ZEBString& text);
    void Append(const unsigned char* text, unsigned int n);
    void Append(const unsigned short* text, unsigned int n);
    void Append(const unsigned int* text, unsigned int n);
    void Append(ITOVString* text);

    void ConvertTo(_tovUnicodeType type);
    void ToUpper();
    void ToLower();

    /// Characters by index; the text forms take the buffer's capacity in
    /// `*size` and give back the units written.
    void GetCharacter(unsigned int index, unsigned char* out, unsigned int* size) const;
    void SetCharacter(unsigned int index, const unsigned char* text, unsigned int size);
    void GetCharacter(unsigned int index, unsigned short* out, unsigned int* size) const;
    void SetCharacter(unsigned int index, const unsigned short* text, unsigned int size);
    void GetCharacter(unsigned int index, unsigned int* codePoint) const;
    void SetCharacter(unsigned int index, unsigned int codePoint);
    /// Creates the string when there is none yet.
    void SetExternalBuffer(_tovUnicodeType type, unsigned char* buffer, unsigned int size);
    void RemoveExternalBuffer(unsigned char** buffer);

    /// Zero-terminated views that the string keeps owning until it next changes.
    const unsigned char* GetUTF8String() const;
    const unsigned short* GetUTF16String() const;
    const unsigned int* GetUTF32String() const;
    wchar_t* GetWCHARString() const;

    uint32_t GetByteCount() const;
    uint32_t GetCodePointCount() const;
    uint32_t GetNumCharacters() const;

    /// 1 when there is no string at all; otherwise the component's answer.
    int IsEmpty() const;
    /// Does nothing when there is no string.
    void Clear();

    /// Below zero, zero or above zero; `caseSensitive` 1 makes case count.
    int Compare(const unsigned char* text, unsigned int n, int caseSensitive) const;
    int Compare(const unsigned short* text, unsigned int n, int caseSensitive) const;
    int Compare(const unsigned int* text, unsigned int n, int caseSensitive) const;
    int Compare(ITOVString* other, int caseSensitive) const;

    /// Case-sensitive comparisons.
    bool operator==(const unsigned char* text) const;
    bool operator==(const unsigned short* text) const;
    bool operator==(const unsigned int* text) const;
    bool operator==(ITOVString* other) const;
    bool operator==(const ZEBString& other) const;
    bool operator!=(const unsigned char* text) const;
    bool operator!=(const unsigned short* text) const;
    bool operator!=(const unsigned int* text) const;
    bool operator!=(ITOVString* other) const;
    bool operator!=(const ZEBString& other) const;
    bool operator<(const unsigned char* text) const;
    bool operator<(const unsigned short* text) const;
    bool operator<(const unsigned int* text) const;
    bool operator<(ITOVString* other) const;
    bool operator<(const ZEBString& other) const;
    /// With raw text: this string orders after the text.
    bool operator>(const unsigned char* text) const;
    bool operator>(const unsigned short* text) const;
    bool operator>(const unsigned int* text) const;
    /// With a string: the two differ, in either order. This asymmetry with the
    /// raw-text forms is deliberate and callers rely on it.
    bool operator>(ITOVString* other) const;
    bool operator>(const ZEBString& other) const;

    /// The character index of the first match at or after `start`, or -1.
    int FindString(const unsigned char* text, int start) const;
    int FindString(const unsigned short* text, int start) const;
    int FindString(const unsigned int* text, int start) const;
    int FindString(ITOVString* text, int start) const;
    /// The same searching backward from `start`.
    int FindStringReverse(const unsigned char* text, int start) const;
    int FindStringReverse(const unsigned short* text, int start) const;
    int FindStringReverse(const unsigned int* text, int start) const;
    int FindStringReverse(ITOVString* text, int start) const;

private:
    /// The string for a call that needs one.
    ITOVString* Required() const;
    /// The string, created first when there is none yet.
    ITOVString* Created();

    ITOVString* m_pString;
    /// Not 0: the destructor releases the string.
    int32_t m_Release;
};

/// The left string's text, copied in its encoding, followed by the right's.
ZEBString operator+(const ZEBString& left, const ZEBString& right);
ZEBString operator+(const ZEBString& left, const unsigned char* right);
ZEBString operator+(const ZEBString& left, const unsigned short* right);
ZEBString operator+(const ZEBString& left, const unsigned int* right);
/// A string made from the left text, in its encoding, with the right appended.
ZEBString operator+(const unsigned char* left, const ZEBString& right);
ZEBString operator+(const unsigned short* left, const ZEBString& right);
ZEBString operator+(const unsigned int* left, const ZEBString& right);

}  // namespace ZEB
