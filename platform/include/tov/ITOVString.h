#pragma once
/// The host's reference-counted string component.
///
/// Conventions of this interface:
/// - A length `n` counts units of the encoding of the pointer it goes with.
///   A terminating zero inside `n` is not text.
/// - Indexes and start positions count characters (Unicode code points), so an
///   index computed on a string in any encoding is valid in its wide form.
/// - Malformed input text (bad UTF-8, unpaired surrogates, values above
///   0x10FFFF) is refused with TOV_E_INVALIDARG and leaves the string unchanged.
/// - Buffers handed out by the Get...String operations stay owned by the string
///   and valid until it next changes or dies.
#include <cstdint>

#include "tov/ITOVUnknown.h"

inline constexpr _tovUID IID_ITOVString = {
    0x3D11F1B5, 0xC5D5, 0x4A0D, {0x83, 0x47, 0x57, 0xBD, 0x85, 0x25, 0xB6, 0xDE}};
inline constexpr _tovUID TOVCompID_TOVString = {
    0x6920B1B9, 0x0A9F, 0x40DB, {0x8D, 0xEA, 0x6B, 0xD8, 0x45, 0xCF, 0x8A, 0xD2}};

/// The encoding in which a string stores its text.
enum _tovUnicodeType : int32_t {
    kTOVUnicodeUTF8 = 1,
    kTOVUnicodeUTF16 = 2,  ///< native order
    kTOVUnicodeUTF32 = 3,  ///< native order
    kTOVUnicodeWCHAR = 4,  ///< wchar_t, 32 bits here, handled as UTF-32
};

class ITOVString : public ITOVUnknown {
public:
    /// Replaces the text by `source`'s, stored in encoding `type`.
    virtual TOVRESULT Assign(_tovUnicodeType type, ITOVString* source) = 0;
    /// Replaces the text; a null pointer with n = 1 yields the empty string.
    virtual TOVRESULT Assign(_tovUnicodeType type, const unsigned char* text, unsigned int n) = 0;
    virtual TOVRESULT Assign(_tovUnicodeType type, const unsigned short* text, unsigned int n) = 0;
    virtual TOVRESULT Assign(_tovUnicodeType type, const unsigned int* text, unsigned int n) = 0;
    virtual TOVRESULT Assign(_tovUnicodeType type, const wchar_t* text, unsigned int n) = 0;

    /// Converts the stored text to encoding `type` in place.
    virtual TOVRESULT ConvertTo(_tovUnicodeType type) = 0;
    virtual TOVRESULT ToLower() = 0;
    virtual TOVRESULT ToUpper() = 0;
    /// A new string with the same text in encoding `type`; `*out` owns one reference.
    virtual TOVRESULT ConvertedCopy(_tovUnicodeType type, ITOVString** out) = 0;

    virtual TOVRESULT Append(ITOVString* text) = 0;
    virtual TOVRESULT Append(const unsigned char* text, unsigned int n) = 0;
    virtual TOVRESULT Append(const unsigned short* text, unsigned int n) = 0;
    virtual TOVRESULT Append(const unsigned int* text, unsigned int n) = 0;
    virtual TOVRESULT Append(const wchar_t* text, unsigned int n) = 0;

    /// Zero-terminated views of the text, converting the stored encoding only
    /// when they must. `GetWCHARString` on a wide string hands out the string's
    /// own storage, which the caller may write through.
    virtual TOVRESULT GetUTF8String(const unsigned char** out) = 0;
    virtual TOVRESULT GetUTF16String(const unsigned short** out) = 0;
    virtual TOVRESULT GetUTF32String(const unsigned int** out) = 0;
    virtual TOVRESULT GetWCHARString(wchar_t** out) = 0;

    /// Bytes of the stored text, without the terminator.
    virtual uint32_t GetByteCount() = 0;
    /// Code units of the stored encoding, without the terminator.
    virtual uint32_t GetCodePointCount() = 0;
    /// Characters (Unicode code points).
    virtual uint32_t GetNumCharacters() = 0;

    /// Writes below zero, zero or above zero; `caseSensitive` 1 makes case count,
    /// 0 compares under simple Unicode case folding.
    virtual TOVRESULT Compare(ITOVString* other, int* result, int caseSensitive) = 0;
    virtual TOVRESULT Compare(const unsigned char* text, unsigned int n, int* result, int caseSensitive) = 0;
    virtual TOVRESULT Compare(const unsigned short* text, unsigned int n, int* result, int caseSensitive) = 0;
    virtual TOVRESULT Compare(const unsigned int* text, unsigned int n, int* result, int caseSensitive) = 0;
    virtual TOVRESULT Compare(const wchar_t* text, unsigned int n, int* result, int caseSensitive) = 0;

    /// Writes the character index of the first match at or after `start`, or -1.
    virtual TOVRESULT FindString(ITOVString* text, int start, int* position) = 0;
    virtual TOVRESULT FindString(const unsigned char* text, unsigned int n, int start, int* position) = 0;
    virtual TOVRESULT FindString(const unsigned short* text, unsigned int n, int start, int* position) = 0;
    virtual TOVRESULT FindString(const unsigned int* text, unsigned int n, int start, int* position) = 0;
    virtual TOVRESULT FindString(const wchar_t* text, unsigned int n, int start, int* position) = 0;

    /// Writes the index of the last match that begins at or before `start`
    /// (a negative start, or one past the end, searches from the end), or -1.
    virtual TOVRESULT FindStringReverse(ITOVString* text, int start, int* position) = 0;
    virtual TOVRESULT FindStringReverse(const unsigned char* text, unsigned int n, int start, int* position) = 0;
    virtual TOVRESULT FindStringReverse(const unsigned short* text, unsigned int n, int start, int* position) = 0;
    virtual TOVRESULT FindStringReverse(const unsigned int* text, unsigned int n, int start, int* position) = 0;
    virtual TOVRESULT FindStringReverse(const wchar_t* text, unsigned int n, int start, int* position) = 0;

    /// One character by character index. The UTF-8 and UTF-16 forms read into a
    /// buffer whose capacity in units is `*size` on entry and the units written
    /// on return; they write `size` units when setting.
    virtual TOVRESULT GetCharacter(unsigned int index, unsigned char* out, unsigned int* size) = 0;
    virtual TOVRESULT SetCharacter(unsigned int index, const unsigned char* text, unsigned int size) = 0;
    virtual TOVRESULT GetCharacter(unsigned int index, unsigned short* out, unsigned int* size) = 0;
    virtual TOVRESULT SetCharacter(unsigned int index, const unsigned short* text, unsigned int size) = 0;
    virtual TOVRESULT GetCharacter(unsigned int index, unsigned int* codePoint) = 0;
    virtual TOVRESULT SetCharacter(unsigned int index, unsigned int codePoint) = 0;
    /// Keeps the first `count` characters.
    virtual TOVRESULT Truncate(unsigned int count) = 0;

    /// Makes the string keep its text in the caller's buffer of `size` bytes,
    /// in encoding `type`, starting from the zero-terminated text already there.
    /// Changes that do not fit, terminator included, fail with TOV_E_OUTOFRANGE.
    virtual TOVRESULT SetExternalBuffer(_tovUnicodeType type, unsigned char* buffer, unsigned int size) = 0;
    /// Ends external storage: the string keeps a copy of its text and hands the buffer back.
    virtual TOVRESULT RemoveExternalBuffer(unsigned char** buffer) = 0;

    virtual _tovUnicodeType GetUnicodeType() = 0;
    /// 1 when the string has no text.
    virtual int IsEmpty() = 0;
    virtual TOVRESULT Clear() = 0;

protected:
    ~ITOVString() = default;
};
