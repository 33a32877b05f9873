#pragma once
/// The host's string component (TOVCompID_TOVString).
///
/// How this implementation reads the interface:
/// - The text is held as code points; the stored encoding is what
///   GetUnicodeType reports, what the counts measure and the form an external
///   buffer is kept in. A new string is empty and wide (kTOVUnicodeWCHAR).
/// - Text handed in as UTF-8 is kept as it came, as the UTF-8 view, and
///   decoded into code points only when something needs them. So is UTF-8
///   in an external buffer, which is then its own UTF-8 view: no copy of it
///   is made until the text changes or the buffer is removed.
/// - Input text ends at its first zero unit within `n`; what follows is not
///   read. A null pointer with `n` 0 or 1 is the empty text, with a larger `n`
///   TOV_E_INVALIDARG. So the text never holds U+0000 through the interface,
///   and every zero-terminated view is exact.
/// - GetUTF8String, GetUTF16String and GetUTF32String convert into a side
///   buffer of their own and never change the stored encoding; each such
///   buffer keeps its address until the text changes. GetWCHARString hands
///   out the string's own code points whatever the stored encoding, and
///   writing through it changes the text (not its length). A value written
///   there that is not a Unicode scalar value reads as U+FFFD everywhere else;
///   an external buffer learns of such writes at the string's next change.
/// - Compare with `caseSensitive` 0 compares the code points after each has
///   gone through towupper then towlower of the C.UTF-8 locale (simple case
///   folding); any other value compares the code points as they are.
/// - A negative start searches forward from 0. An empty needle is found at
///   `start` forward (-1 when start is past the end) and at min(start, length)
///   in reverse (length when searching from the end).
/// - GetCharacter into a buffer that is too small fails with
///   TOV_E_INVALIDARG and writes the units needed to `*size`. A character to
///   set must be exactly one scalar value other than U+0000.
/// - SetExternalBuffer while one is set is ZEB_E_ALREADYSET;
///   RemoveExternalBuffer without one is ZEB_E_NOTREADY. The buffer must hold
///   a terminator within `size` bytes; it needs no alignment. Converting to
///   another encoding while external rewrites the buffer in that encoding.
/// - Null pointer arguments are TOV_E_INVALIDARG; an unknown encoding too.
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "tov/ITOVString.h"
#include "tov/sdk/CTOVUnknown.h"

class HostString : public ITOVString, public CTOVUnknown {
public:
    static TOVRESULT TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out);
    explicit HostString(ITOVUnknown* outer) : CTOVUnknown(outer) {}

    TOV_FORWARD_UNKNOWN

    TOVRESULT Assign(_tovUnicodeType type, ITOVString* source) override;
    TOVRESULT Assign(_tovUnicodeType type, const unsigned char* text, unsigned int n) override;
    TOVRESULT Assign(_tovUnicodeType type, const unsigned short* text, unsigned int n) override;
    TOVRESULT Assign(_tovUnicodeType type, const unsigned int* text, unsigned int n) override;
    TOVRESULT Assign(_tovUnicodeType type, const wchar_t* text, unsigned int n) override;

    TOVRESULT ConvertTo(_tovUnicodeType type) override;
    TOVRESULT ToLower() override;
    TOVRESULT ToUpper() override;
    TOVRESULT ConvertedCopy(_tovUnicodeType type, ITOVString** out) override;

    TOVRESULT Append(ITOVString* text) override;
    TOVRESULT Append(const unsigned char* text, unsigned int n) override;
    TOVRESULT Append(const unsigned short* text, unsigned int n) override;
    TOVRESULT Append(const unsigned int* text, unsigned int n) override;
    TOVRESULT Append(const wchar_t* text, unsigned int n) override;

    TOVRESULT GetUTF8String(const unsigned char** out) override;
    TOVRESULT GetUTF16String(const unsigned short** out) override;
    TOVRESULT GetUTF32String(const unsigned int** out) override;
    TOVRESULT GetWCHARString(wchar_t** out) override;

    uint32_t GetByteCount() override;
    uint32_t GetCodePointCount() override;
    uint32_t GetNumCharacters() override;

    TOVRESULT Compare(ITOVString* other, int* result, int caseSensitive) override;
    TOVRESULT Compare(const unsigned char* text, unsigned int n, int* result, int caseSensitive) override;
    TOVRESULT Compare(const unsigned short* text, unsigned int n, int* result, int caseSensitive) override;
    TOVRESULT Compare(const unsigned int* text, unsigned int n, int* result, int caseSensitive) override;
    TOVRESULT Compare(const wchar_t* text, unsigned int n, int* result, int caseSensitive) override;

    TOVRESULT FindString(ITOVString* text, int start, int* position) override;
    TOVRESULT FindString(const unsigned char* text, unsigned int n, int start, int* position) override;
    TOVRESULT FindString(const unsigned short* text, unsigned int n, int start, int* position) override;
    TOVRESULT FindString(const unsigned int* text, unsigned int n, int start, int* position) override;
    TOVRESULT FindString(const wchar_t* text, unsigned int n, int start, int* position) override;

    TOVRESULT FindStringReverse(ITOVString* text, int start, int* position) override;
    TOVRESULT FindStringReverse(const unsigned char* text, unsigned int n, int start, int* position) override;
    TOVRESULT FindStringReverse(const unsigned short* text, unsigned int n, int start, int* position) override;
    TOVRESULT FindStringReverse(const unsigned int* text, unsigned int n, int start, int* position) override;
    TOVRESULT FindStringReverse(const wchar_t* text, unsigned int n, int start, int* position) override;

    TOVRESULT GetCharacter(unsigned int index, unsigned char* out, unsigned int* size) override;
    TOVRESULT SetCharacter(unsigned int index, const unsigned char* text, unsigned int size) override;
    TOVRESULT GetCharacter(unsigned int index, unsigned short* out, unsigned int* size) override;
    TOVRESULT SetCharacter(unsigned int index, const unsigned short* text, unsigned int size) override;
    TOVRESULT GetCharacter(unsigned int index, unsigned int* codePoint) override;
    TOVRESULT SetCharacter(unsigned int index, unsigned int codePoint) override;
    TOVRESULT Truncate(unsigned int count) override;

    TOVRESULT SetExternalBuffer(_tovUnicodeType type, unsigned char* buffer, unsigned int size) override;
    TOVRESULT RemoveExternalBuffer(unsigned char** buffer) override;

    _tovUnicodeType GetUnicodeType() override { return m_Type; }
    int IsEmpty() override;
    TOVRESULT Clear() override;

    TOVRESULT InternalQueryInterface(const _tovUID& iid, void** out) override;

private:
    /// The code points, decoded first when the text is kept as UTF-8 only.
    const std::wstring& Text();
    /// The text with every non-scalar value replaced by U+FFFD.
    std::wstring CodePoints();
    /// The UTF-8 not yet decoded: the external buffer's while borrowed, else m_UTF8.
    std::string_view PendingUTF8() const;
    /// Takes the zero-terminated UTF-8 at the start of `buffer` as the text,
    /// in place; a missing terminator or malformed text throws TOV_E_INVALIDARG.
    void BorrowUTF8(const unsigned char* buffer, unsigned int size);
    /// Makes `text` the string's text in encoding `type`, or throws
    /// TOV_E_OUTOFRANGE when an external buffer cannot hold it; all or nothing.
    void Commit(std::wstring text, _tovUnicodeType type);
    /// The stored encoding is `type`, the views are stale, and the wide storage
    /// handed out is no longer the text.
    void Changed(_tovUnicodeType type);
    TOVRESULT AssignText(_tovUnicodeType type, std::wstring text);
    TOVRESULT AppendText(const std::wstring& text);
    TOVRESULT CompareText(const std::wstring& other, int* result, int caseSensitive);
    TOVRESULT FindText(const std::wstring& needle, int start, int* position);
    TOVRESULT FindTextReverse(const std::wstring& needle, int start, int* position);
    TOVRESULT SetCharacterText(unsigned int index, const std::wstring& character);
    /// The character at `index`, or throws TOV_E_OUTOFRANGE.
    wchar_t CharacterAt(unsigned int index);

    /// The text of another string, which may be this one.
    static std::wstring TextOf(ITOVString* source);
    static bool IsKnownType(_tovUnicodeType type);
    /// `text` in encoding `type`, terminator included, as raw native-order bytes.
    static std::vector<unsigned char> EncodeBytes(const std::wstring& text, _tovUnicodeType type);

    /// The code points; while `m_WidePending`, not yet decoded from `m_UTF8`.
    std::wstring m_Text;
    bool m_WidePending = false;
    _tovUnicodeType m_Type = kTOVUnicodeWCHAR;
    std::string m_UTF8;
    /// While set, the text is the UTF-8 in the external buffer, not yet decoded.
    const char* m_Borrowed = nullptr;
    size_t m_BorrowedLength = 0;
    std::vector<unsigned short> m_UTF16;
    std::vector<unsigned int> m_UTF32;
    /// Which views match the text. A view is remade only when the text changed
    /// or while the wide storage is handed out, as writes through it bypass Commit.
    bool m_UTF8Fresh = false;
    bool m_UTF16Fresh = false;
    bool m_UTF32Fresh = false;
    bool m_WideHandedOut = false;
    unsigned char* m_External = nullptr;
    unsigned int m_ExternalSize = 0;
};
