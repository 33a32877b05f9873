#include "tov/host/HostString.h"

#include <locale.h>
#include <wctype.h>

#include <algorithm>
#include <cstring>

#include "tov/host/CreateKnownComponent.h"
#include "tov/host/UTF8Locale.h"
#include "tov/host/UnicodeCodec.h"
#include "tov/sdk/TOVComponent.h"
#include "tov/sdk/TOVPtr.h"

namespace {

[[noreturn]] void Fail(TOVRESULT result) { throw static_cast<int>(result); }

// The text is worked on as it is kept, as wide code points, so that nothing
// is converted once more on its way in or out.
bool Decode(const unsigned char* text, size_t n, std::wstring& out) { return UnicodeCodec::DecodeUTF8(text, n, out); }
bool Decode(const unsigned short* text, size_t n, std::wstring& out) { return UnicodeCodec::DecodeUTF16(text, n, out); }
bool Decode(const unsigned int* text, size_t n, std::wstring& out) { return UnicodeCodec::DecodeUTF32(text, n, out); }
bool Decode(const wchar_t* text, size_t n, std::wstring& out) { return UnicodeCodec::DecodeUTF32(text, n, out); }

// Units of an input before its first zero within `n`.
template <class Unit>
size_t LengthWithin(const Unit* text, unsigned int n) {
    size_t length = 0;
    while (length < n && text[length] != 0) ++length;
    return length;
}

// Bytes are the common input, and long ones (whole documents) come as UTF-8.
size_t LengthWithin(const unsigned char* text, unsigned int n) {
    const void* zero = std::memchr(text, 0, n);
    return zero ? static_cast<size_t>(static_cast<const unsigned char*>(zero) - text) : n;
}

// Input text: up to `n` units, ending at the first zero.
template <class Unit>
std::wstring ReadText(const Unit* text, unsigned int n) {
    if (!text) {
        if (n > 1) Fail(TOV_E_INVALIDARG);
        return {};
    }
    std::wstring decoded;
    if (!Decode(text, LengthWithin(text, n), decoded)) Fail(TOV_E_INVALIDARG);
    return decoded;
}

// The zero-terminated text at the start of a caller's buffer, which may be unaligned.
template <class Unit>
std::wstring ReadBuffer(const unsigned char* buffer, unsigned int size) {
    std::vector<Unit> units;
    for (size_t offset = 0; offset + sizeof(Unit) <= size; offset += sizeof(Unit)) {
        Unit unit;
        std::memcpy(&unit, buffer + offset, sizeof unit);
        if (unit == 0) {
            std::wstring decoded;
            if (!Decode(units.data(), units.size(), decoded)) Fail(TOV_E_INVALIDARG);
            return decoded;
        }
        units.push_back(unit);
    }
    Fail(TOV_E_INVALIDARG);  // no terminator within the buffer
}

template <class Units>
std::vector<unsigned char> TerminatedBytes(Units units) {
    units.push_back(0);
    const auto* first = reinterpret_cast<const unsigned char*>(units.data());
    return std::vector<unsigned char>(first, first + units.size() * sizeof units[0]);
}

// Units that valid UTF-8 takes in encoding `type`, counted on its bytes: each
// byte that does not continue a sequence starts a code point, and each lead of
// a four-byte sequence starts one that UTF-16 writes as a pair.
size_t UnitsOf(std::string_view utf8, _tovUnicodeType type) {
    if (type == kTOVUnicodeUTF8) return utf8.size();
    size_t units = 0;
    for (const char c : utf8) {
        const auto byte = static_cast<unsigned char>(c);
        if ((byte & 0xC0) != 0x80) ++units;
        if (type == kTOVUnicodeUTF16 && byte >= 0xF0) ++units;
    }
    return units;
}

// Keeps the address a caller was given while the contents stay the same.
template <class Buffer>
void Refresh(Buffer& cache, Buffer fresh) {
    if (fresh != cache) cache = std::move(fresh);
}

template <class Units, class Unit>
TOVRESULT CopyUnits(const Units& units, Unit* out, unsigned int* size) {
    const auto needed = static_cast<unsigned int>(units.size());
    if (*size < needed) {
        *size = needed;
        return TOV_E_INVALIDARG;
    }
    std::copy(units.begin(), units.end(), out);
    *size = needed;
    return TOV_OK;
}

locale_t CaseLocale() {
    const locale_t locale = UTF8Locale();
    if (!locale) Fail(TOV_E_NOTSUPPORTED);
    return locale;
}

std::wstring ChangeCase(std::wstring text, bool upper) {
    const locale_t locale = CaseLocale();
    for (wchar_t& cp : text) cp = static_cast<wchar_t>(upper ? towupper_l(cp, locale) : towlower_l(cp, locale));
    return text;
}

// Upper then lower also joins letters with several lower forms (final sigma, long s).
std::wstring Folded(std::wstring text) { return ChangeCase(ChangeCase(std::move(text), true), false); }

}  // namespace

TOVRESULT HostString::TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out) {
    return TOVCreateComponent<HostString>(host, outer, iid, out);
}

TOVRESULT HostString::InternalQueryInterface(const _tovUID& iid, void** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        if (iid == IID_ITOVString) return TOVExpose<ITOVString>(this, out);
        return CTOVUnknown::InternalQueryInterface(iid, out);
    });
}

// ---- Changing the text

TOVRESULT HostString::Assign(_tovUnicodeType type, ITOVString* source) {
    return TOVGuarded([&] {
        // Text still kept as it came in as UTF-8 is copied in that form.
        if (auto* same = dynamic_cast<HostString*>(source); same && same->m_WidePending) {
            const std::string_view utf8 = same->PendingUTF8();
            return Assign(type, reinterpret_cast<const unsigned char*>(utf8.data()),
                          static_cast<unsigned int>(utf8.size()));
        }
        return AssignText(type, TextOf(source));
    });
}

TOVRESULT HostString::Assign(_tovUnicodeType type, const unsigned char* text, unsigned int n) {
    return TOVGuarded([&] {
        // An external buffer takes the text in its encoding at once.
        if (m_External) return AssignText(type, ReadText(text, n));
        if (!text && n > 1) return TOV_E_INVALIDARG;
        const size_t length = text ? LengthWithin(text, n) : 0;
        if (!UnicodeCodec::IsValidUTF8(text, length) || !IsKnownType(type)) return TOV_E_INVALIDARG;
        // Valid UTF-8 is the one encoding of its code points, so the input is
        // kept as it came, as the UTF-8 view, and decoded only when something
        // needs the code points: texts handed in as UTF-8 (names, values,
        // whole XML documents) are mostly read back as UTF-8.
        m_UTF8.assign(text ? reinterpret_cast<const char*>(text) : "", length);
        m_Text.clear();
        m_WidePending = true;
        Changed(type);
        m_UTF8Fresh = true;
        return TOV_OK;
    });
}

TOVRESULT HostString::Assign(_tovUnicodeType type, const unsigned short* text, unsigned int n) {
    return TOVGuarded([&] { return AssignText(type, ReadText(text, n)); });
}

TOVRESULT HostString::Assign(_tovUnicodeType type, const unsigned int* text, unsigned int n) {
    return TOVGuarded([&] { return AssignText(type, ReadText(text, n)); });
}

TOVRESULT HostString::Assign(_tovUnicodeType type, const wchar_t* text, unsigned int n) {
    return TOVGuarded([&] { return AssignText(type, ReadText(text, n)); });
}

TOVRESULT HostString::AssignText(_tovUnicodeType type, std::wstring text) {
    if (!IsKnownType(type)) return TOV_E_INVALIDARG;
    Commit(std::move(text), type);
    return TOV_OK;
}

TOVRESULT HostString::ConvertTo(_tovUnicodeType type) {
    return TOVGuarded([&] {
        // The stored encoding names only the form the counts and an external
        // buffer use: with no buffer to rewrite, and no writes through the
        // wide storage to clean up, the code points and their views stand.
        if (IsKnownType(type) && !m_External && !m_WideHandedOut) {
            m_Type = type;
            return TOV_OK;
        }
        return AssignText(type, CodePoints());
    });
}

TOVRESULT HostString::ToLower() {
    return TOVGuarded([&] {
        Commit(ChangeCase(CodePoints(), false), m_Type);
        return TOV_OK;
    });
}

TOVRESULT HostString::ToUpper() {
    return TOVGuarded([&] {
        Commit(ChangeCase(CodePoints(), true), m_Type);
        return TOV_OK;
    });
}

TOVRESULT HostString::ConvertedCopy(_tovUnicodeType type, ITOVString** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        *out = nullptr;
        if (!IsKnownType(type)) return TOV_E_INVALIDARG;
        TOVPtr<ITOVString> copy;
        TOVCheck((CreateKnownComponent<ITOVString, HostString>(copy.OutT())));
        TOVCheck(copy->Assign(type, this));
        *out = copy.Detach();
        return TOV_OK;
    });
}

TOVRESULT HostString::Append(ITOVString* text) {
    return TOVGuarded([&] { return AppendText(TextOf(text)); });
}

TOVRESULT HostString::Append(const unsigned char* text, unsigned int n) {
    return TOVGuarded([&] { return AppendText(ReadText(text, n)); });
}

TOVRESULT HostString::Append(const unsigned short* text, unsigned int n) {
    return TOVGuarded([&] { return AppendText(ReadText(text, n)); });
}

TOVRESULT HostString::Append(const unsigned int* text, unsigned int n) {
    return TOVGuarded([&] { return AppendText(ReadText(text, n)); });
}

TOVRESULT HostString::Append(const wchar_t* text, unsigned int n) {
    return TOVGuarded([&] { return AppendText(ReadText(text, n)); });
}

TOVRESULT HostString::AppendText(const std::wstring& text) {
    Commit(CodePoints() + text, m_Type);
    return TOV_OK;
}

TOVRESULT HostString::Clear() {
    return TOVGuarded([&] {
        Commit(std::wstring(), m_Type);
        return TOV_OK;
    });
}

TOVRESULT HostString::Truncate(unsigned int count) {
    return TOVGuarded([&] {
        if (count < Text().size()) Commit(CodePoints().substr(0, count), m_Type);
        return TOV_OK;
    });
}

void HostString::Commit(std::wstring text, _tovUnicodeType type) {
    // Everything that can fail happens before the first change.
    if (m_External) {
        const std::vector<unsigned char> bytes = EncodeBytes(text, type);
        if (bytes.size() > m_ExternalSize) Fail(TOV_E_OUTOFRANGE);
        std::memcpy(m_External, bytes.data(), bytes.size());
    }
    m_Text.swap(text);
    m_WidePending = false;
    Changed(type);
}

void HostString::Changed(_tovUnicodeType type) {
    m_Type = type;
    m_Borrowed = nullptr;
    m_UTF8Fresh = m_UTF16Fresh = m_UTF32Fresh = false;
    m_WideHandedOut = false;  // the storage handed out is no longer valid
}

const std::wstring& HostString::Text() {
    if (m_WidePending) {
        // The bytes were checked when they came in, so they decode.
        const std::string_view utf8 = PendingUTF8();
        UnicodeCodec::DecodeUTF8(reinterpret_cast<const unsigned char*>(utf8.data()), utf8.size(), m_Text);
        m_WidePending = false;
        m_Borrowed = nullptr;
    }
    return m_Text;
}

// ---- Views and counts

TOVRESULT HostString::GetUTF8String(const unsigned char** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        // Text kept in an external buffer as UTF-8 is its own view.
        if (m_Borrowed) {
            *out = reinterpret_cast<const unsigned char*>(m_Borrowed);
            return TOV_OK;
        }
        if (!m_UTF8Fresh || m_WideHandedOut) Refresh(m_UTF8, UnicodeCodec::EncodeUTF8(std::wstring_view(Text())));
        m_UTF8Fresh = true;
        *out = reinterpret_cast<const unsigned char*>(m_UTF8.c_str());
        return TOV_OK;
    });
}

TOVRESULT HostString::GetUTF16String(const unsigned short** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        if (!m_UTF16Fresh || m_WideHandedOut) {
            std::vector<unsigned short> units = UnicodeCodec::EncodeUTF16(std::wstring_view(Text()));
            units.push_back(0);
            Refresh(m_UTF16, std::move(units));
        }
        m_UTF16Fresh = true;
        *out = m_UTF16.data();
        return TOV_OK;
    });
}

TOVRESULT HostString::GetUTF32String(const unsigned int** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        if (!m_UTF32Fresh || m_WideHandedOut) {
            std::vector<unsigned int> units = UnicodeCodec::EncodeUTF32(std::wstring_view(Text()));
            units.push_back(0);
            Refresh(m_UTF32, std::move(units));
        }
        m_UTF32Fresh = true;
        *out = m_UTF32.data();
        return TOV_OK;
    });
}

TOVRESULT HostString::GetWCHARString(wchar_t** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        Text();
        m_WideHandedOut = true;
        *out = m_Text.data();
        return TOV_OK;
    });
}

uint32_t HostString::GetCodePointCount() {
    if (m_WidePending) return static_cast<uint32_t>(UnitsOf(PendingUTF8(), m_Type));
    if (m_Type != kTOVUnicodeUTF8 && m_Type != kTOVUnicodeUTF16) return static_cast<uint32_t>(m_Text.size());
    size_t units = 0;
    for (wchar_t wc : m_Text) {
        const auto cp = static_cast<char32_t>(wc);
        units += m_Type == kTOVUnicodeUTF8 ? UnicodeCodec::UTF8Length(cp) : UnicodeCodec::UTF16Length(cp);
    }
    return static_cast<uint32_t>(units);
}

uint32_t HostString::GetByteCount() {
    const uint32_t unitSize = m_Type == kTOVUnicodeUTF8 ? 1 : m_Type == kTOVUnicodeUTF16 ? 2 : 4;
    return GetCodePointCount() * unitSize;
}

uint32_t HostString::GetNumCharacters() {
    return static_cast<uint32_t>(m_WidePending ? UnitsOf(PendingUTF8(), kTOVUnicodeUTF32) : m_Text.size());
}

int HostString::IsEmpty() { return (m_WidePending ? PendingUTF8().empty() : m_Text.empty()) ? 1 : 0; }

std::string_view HostString::PendingUTF8() const {
    return m_Borrowed ? std::string_view(m_Borrowed, m_BorrowedLength) : std::string_view(m_UTF8);
}

std::wstring HostString::CodePoints() {
    std::wstring text(Text());
    for (wchar_t& wc : text) {
        if (!UnicodeCodec::IsScalarValue(static_cast<uint32_t>(wc)))
            wc = static_cast<wchar_t>(UnicodeCodec::kReplacement);
    }
    return text;
}

std::wstring HostString::TextOf(ITOVString* source) {
    if (!source) Fail(TOV_E_INVALIDARG);
    // Between two strings of this host, the code points are at hand.
    if (auto* same = dynamic_cast<HostString*>(source)) return same->CodePoints();
    const unsigned int* units = nullptr;
    TOVCheck(source->GetUTF32String(&units));
    if (!units) Fail(TOV_E_POINTER);
    std::wstring text;
    if (!UnicodeCodec::DecodeUTF32(units, source->GetNumCharacters(), text)) Fail(TOV_E_INVALIDARG);
    return text;
}

// ---- Comparing and searching

TOVRESULT HostString::Compare(ITOVString* other, int* result, int caseSensitive) {
    return TOVGuarded([&] { return CompareText(TextOf(other), result, caseSensitive); });
}

TOVRESULT HostString::Compare(const unsigned char* text, unsigned int n, int* result, int caseSensitive) {
    return TOVGuarded([&] { return CompareText(ReadText(text, n), result, caseSensitive); });
}

TOVRESULT HostString::Compare(const unsigned short* text, unsigned int n, int* result, int caseSensitive) {
    return TOVGuarded([&] { return CompareText(ReadText(text, n), result, caseSensitive); });
}

TOVRESULT HostString::Compare(const unsigned int* text, unsigned int n, int* result, int caseSensitive) {
    return TOVGuarded([&] { return CompareText(ReadText(text, n), result, caseSensitive); });
}

TOVRESULT HostString::Compare(const wchar_t* text, unsigned int n, int* result, int caseSensitive) {
    return TOVGuarded([&] { return CompareText(ReadText(text, n), result, caseSensitive); });
}

TOVRESULT HostString::CompareText(const std::wstring& other, int* result, int caseSensitive) {
    if (!result) return TOV_E_INVALIDARG;
    const int order = caseSensitive ? CodePoints().compare(other) : Folded(CodePoints()).compare(Folded(other));
    *result = order < 0 ? -1 : order > 0 ? 1 : 0;
    return TOV_OK;
}

TOVRESULT HostString::FindString(ITOVString* text, int start, int* position) {
    return TOVGuarded([&] { return FindText(TextOf(text), start, position); });
}

TOVRESULT HostString::FindString(const unsigned char* text, unsigned int n, int start, int* position) {
    return TOVGuarded([&] { return FindText(ReadText(text, n), start, position); });
}

TOVRESULT HostString::FindString(const unsigned short* text, unsigned int n, int start, int* position) {
    return TOVGuarded([&] { return FindText(ReadText(text, n), start, position); });
}

TOVRESULT HostString::FindString(const unsigned int* text, unsigned int n, int start, int* position) {
    return TOVGuarded([&] { return FindText(ReadText(text, n), start, position); });
}

TOVRESULT HostString::FindString(const wchar_t* text, unsigned int n, int start, int* position) {
    return TOVGuarded([&] { return FindText(ReadText(text, n), start, position); });
}

TOVRESULT HostString::FindStringReverse(ITOVString* text, int start, int* position) {
    return TOVGuarded([&] { return FindTextReverse(TextOf(text), start, position); });
}

TOVRESULT HostString::FindStringReverse(const unsigned char* text, unsigned int n, int start, int* position) {
    return TOVGuarded([&] { return FindTextReverse(ReadText(text, n), start, position); });
}

TOVRESULT HostString::FindStringReverse(const unsigned short* text, unsigned int n, int start, int* position) {
    return TOVGuarded([&] { return FindTextReverse(ReadText(text, n), start, position); });
}

TOVRESULT HostString::FindStringReverse(const unsigned int* text, unsigned int n, int start, int* position) {
    return TOVGuarded([&] { return FindTextReverse(ReadText(text, n), start, position); });
}

TOVRESULT HostString::FindStringReverse(const wchar_t* text, unsigned int n, int start, int* position) {
    return TOVGuarded([&] { return FindTextReverse(ReadText(text, n), start, position); });
}

TOVRESULT HostString::FindText(const std::wstring& needle, int start, int* position) {
    if (!position) return TOV_E_INVALIDARG;
    const size_t found = CodePoints().find(needle, start < 0 ? 0 : static_cast<size_t>(start));
    *position = found == std::wstring::npos ? -1 : static_cast<int>(found);
    return TOV_OK;
}

TOVRESULT HostString::FindTextReverse(const std::wstring& needle, int start, int* position) {
    if (!position) return TOV_E_INVALIDARG;
    // A start at or past the end already searches from the end.
    const size_t found = CodePoints().rfind(needle, start < 0 ? std::wstring::npos : static_cast<size_t>(start));
    *position = found == std::wstring::npos ? -1 : static_cast<int>(found);
    return TOV_OK;
}

// ---- Single characters

TOVRESULT HostString::GetCharacter(unsigned int index, unsigned char* out, unsigned int* size) {
    return TOVGuarded([&] {
        if (!out || !size) return TOV_E_INVALIDARG;
        return CopyUnits(UnicodeCodec::EncodeUTF8(std::wstring(1, CharacterAt(index))), out, size);
    });
}

TOVRESULT HostString::GetCharacter(unsigned int index, unsigned short* out, unsigned int* size) {
    return TOVGuarded([&] {
        if (!out || !size) return TOV_E_INVALIDARG;
        return CopyUnits(UnicodeCodec::EncodeUTF16(std::wstring(1, CharacterAt(index))), out, size);
    });
}

TOVRESULT HostString::GetCharacter(unsigned int index, unsigned int* codePoint) {
    return TOVGuarded([&] {
        if (!codePoint) return TOV_E_INVALIDARG;
        *codePoint = static_cast<unsigned int>(CharacterAt(index));
        return TOV_OK;
    });
}

TOVRESULT HostString::SetCharacter(unsigned int index, const unsigned char* text, unsigned int size) {
    return TOVGuarded([&] { return SetCharacterText(index, ReadText(text, size)); });
}

TOVRESULT HostString::SetCharacter(unsigned int index, const unsigned short* text, unsigned int size) {
    return TOVGuarded([&] { return SetCharacterText(index, ReadText(text, size)); });
}

TOVRESULT HostString::SetCharacter(unsigned int index, unsigned int codePoint) {
    return TOVGuarded([&] { return SetCharacterText(index, ReadText(&codePoint, 1)); });
}

TOVRESULT HostString::SetCharacterText(unsigned int index, const std::wstring& character) {
    if (index >= Text().size()) return TOV_E_OUTOFRANGE;
    if (character.size() != 1) return TOV_E_INVALIDARG;
    std::wstring text = CodePoints();
    text[index] = character[0];
    Commit(std::move(text), m_Type);
    return TOV_OK;
}

wchar_t HostString::CharacterAt(unsigned int index) {
    if (index >= Text().size()) Fail(TOV_E_OUTOFRANGE);
    const wchar_t value = m_Text[index];
    return UnicodeCodec::IsScalarValue(static_cast<uint32_t>(value)) ? value
                                                                     : static_cast<wchar_t>(UnicodeCodec::kReplacement);
}

// ---- External storage

TOVRESULT HostString::SetExternalBuffer(_tovUnicodeType type, unsigned char* buffer, unsigned int size) {
    return TOVGuarded([&] {
        if (!buffer || !IsKnownType(type)) return TOV_E_INVALIDARG;
        if (m_External) return ZEB_E_ALREADYSET;
        if (type == kTOVUnicodeUTF8) {
            BorrowUTF8(buffer, size);
            m_External = buffer;
            m_ExternalSize = size;
            return TOV_OK;
        }
        std::wstring text;
        if (type == kTOVUnicodeUTF16) {
            text = ReadBuffer<unsigned short>(buffer, size);
        } else {
            text = ReadBuffer<unsigned int>(buffer, size);
        }
        // The buffer already holds this text, so it is only adopted afterwards.
        Commit(std::move(text), type);
        m_External = buffer;
        m_ExternalSize = size;
        return TOV_OK;
    });
}

// UTF-8 in the caller's buffer is, like UTF-8 handed in, kept as it is and
// decoded only when code points are needed: the buffer may hold a whole
// document, which neither a copy nor four bytes a character should double.
void HostString::BorrowUTF8(const unsigned char* buffer, unsigned int size) {
    const void* zero = std::memchr(buffer, 0, size);
    if (!zero) Fail(TOV_E_INVALIDARG);  // no terminator within the buffer
    const size_t length = static_cast<size_t>(static_cast<const unsigned char*>(zero) - buffer);
    if (!UnicodeCodec::IsValidUTF8(buffer, length)) Fail(TOV_E_INVALIDARG);
    m_Text.clear();
    m_WidePending = true;
    Changed(kTOVUnicodeUTF8);
    m_Borrowed = reinterpret_cast<const char*>(buffer);
    m_BorrowedLength = length;
}

TOVRESULT HostString::RemoveExternalBuffer(unsigned char** buffer) {
    if (!buffer) return TOV_E_INVALIDARG;
    *buffer = m_External;
    if (!m_External) return ZEB_E_NOTREADY;
    if (m_Borrowed) {
        // The text stays, now in a copy of the string's own.
        m_UTF8.assign(m_Borrowed, m_BorrowedLength);
        m_Borrowed = nullptr;
        m_UTF8Fresh = true;
    }
    m_External = nullptr;
    m_ExternalSize = 0;
    return TOV_OK;
}

std::vector<unsigned char> HostString::EncodeBytes(const std::wstring& text, _tovUnicodeType type) {
    if (type == kTOVUnicodeUTF8) {
        const std::string units = UnicodeCodec::EncodeUTF8(text);
        return TerminatedBytes(std::vector<unsigned char>(units.begin(), units.end()));
    }
    if (type == kTOVUnicodeUTF16) return TerminatedBytes(UnicodeCodec::EncodeUTF16(text));
    return TerminatedBytes(UnicodeCodec::EncodeUTF32(text));
}

bool HostString::IsKnownType(_tovUnicodeType type) {
    return type == kTOVUnicodeUTF8 || type == kTOVUnicodeUTF16 || type == kTOVUnicodeUTF32 || type == kTOVUnicodeWCHAR;
}
