#include "strings/ZEBString.h"

#include <cstring>

#include "startup/ZEBUtilLib.h"
#include "tov/sdk/TOVFailureStyle.h"

namespace ZEB {

namespace {

template <class Unit>
unsigned int UnitsBeforeTerminator(const Unit* text) {
    unsigned int n = 0;
    while (text[n] != 0) ++n;
    return n;
}

// UTF-8 is the common form, and the one long texts (documents) come in.
unsigned int UnitsBeforeTerminator(const unsigned char* text) {
    return static_cast<unsigned int>(std::strlen(reinterpret_cast<const char*>(text)));
}

// Counts for text handed over without a count: the null pointer goes on as
// null with the count of a lone terminator.
template <class Unit>
unsigned int WithTerminator(const Unit* text) {
    return text ? UnitsBeforeTerminator(text) + 1 : 1;
}

template <class Unit>
unsigned int WithoutTerminator(const Unit* text) {
    return text ? UnitsBeforeTerminator(text) : 0;
}

[[noreturn]] void ThrowNotReady() { throw static_cast<int>(ZEB_E_NOTREADY); }

// `Text` is a pointer to raw text or an ITOVString*; the overloads of the
// component pick the form.
template <class... Text>
int CompareWith(ITOVString* string, int caseSensitive, Text... text) {
    int result = 0;
    TOVCheck(string->Compare(text..., &result, caseSensitive));
    return result;
}

// A search with no match leaves the position as it was started.
template <class... Text>
int Find(ITOVString* string, int start, Text... text) {
    int position = -1;
    TOVCheck(string->FindString(text..., start, &position));
    return position;
}

template <class... Text>
int FindReverse(ITOVString* string, int start, Text... text) {
    int position = -1;
    TOVCheck(string->FindStringReverse(text..., start, &position));
    return position;
}

template <class Left, class Right>
ZEBString Concatenate(const Left& left, const Right& right) {
    ZEBString result(left);
    result += right;
    return result;
}

}  // namespace

ZEBString::ZEBString() : m_pString(nullptr), m_Release(1) {}

// The text constructors delegate, so a failing assignment still runs the
// destructor and gives the new string back.
ZEBString::ZEBString(const unsigned char* text) : ZEBString() { *this = text; }

ZEBString::ZEBString(const unsigned short* text) : ZEBString() { *this = text; }

ZEBString::ZEBString(const unsigned int* text) : ZEBString() { *this = text; }

ZEBString::ZEBString(_tovUnicodeType type, ITOVString* source) : ZEBString() {
    if (!source) ThrowNotReady();
    if (source->GetUnicodeType() == type) {
        source->AddRef();
        m_pString = source;
    } else {
        Assign(type, source);
    }
}

ZEBString::ZEBString(ITOVString* string, int release) : m_pString(string), m_Release(release) {}

ZEBString::ZEBString(const ZEBString& other) : ZEBString() {
    ITOVString* source = other.Required();
    TOVCheck(source->ConvertedCopy(source->GetUnicodeType(), &m_pString));
}

ZEBString::ZEBString(ZEBString&& other) noexcept : m_pString(other.m_pString), m_Release(other.m_Release) {
    other.m_pString = nullptr;
}

ZEBString::~ZEBString() {
    if (m_pString && m_Release) m_pString->Release();
    m_pString = nullptr;
}

void ZEBString::CreateString(ITOVString** out) {
    if (!ZEBUtilLib::gpClassFactory) ThrowNotReady();
    TOVCheck(ZEBUtilLib::gpClassFactory->CreateInstance(ZEBUtilLib::gpComponentFactory, nullptr, IID_ITOVString,
                                                        reinterpret_cast<void**>(out)));
}

ITOVString* ZEBString::InArg() const { return Required(); }

ITOVString** ZEBString::OutArg() {
    if (m_pString) {
        m_pString->Release();
        m_pString = nullptr;
    }
    // Whatever the call puts here is this object's reference; a view that
    // kept its flag at 0 would leak it.
    m_Release = 1;
    return &m_pString;
}

_tovUnicodeType ZEBString::GetUnicodeType() const { return Required()->GetUnicodeType(); }

ITOVString* ZEBString::Required() const {
    if (!m_pString) ThrowNotReady();
    return m_pString;
}

ITOVString* ZEBString::Created() {
    if (!m_pString) {
        CreateString(&m_pString);
        // A string made here is owned here, even by an object built as a view of null.
        m_Release = 1;
    }
    return m_pString;
}

ZEBString& ZEBString::operator=(const unsigned char* text) {
    Assign(kTOVUnicodeUTF8, text, WithTerminator(text));
    return *this;
}

ZEBString& ZEBString::operator=(const unsigned short* text) {
    Assign(kTOVUnicodeUTF16, text, WithTerminator(text));
    return *this;
}

ZEBString& ZEBString::operator=(const unsigned int* text) {
    Assign(kTOVUnicodeUTF32, text, WithTerminator(text));
    return *this;
}

ZEBString& ZEBString::operator=(ITOVString* source) {
    if (!source) ThrowNotReady();
    Assign(source->GetUnicodeType(), source);
    return *this;
}

ZEBString& ZEBString::operator=(const ZEBString& other) { return *this = other.Required(); }

void ZEBString::Assign(_tovUnicodeType type, const unsigned char* text, unsigned int n) {
    TOVCheck(Created()->Assign(type, text, n));
}

void ZEBString::Assign(_tovUnicodeType type, const unsigned short* text, unsigned int n) {
    TOVCheck(Created()->Assign(type, text, n));
}

void ZEBString::Assign(_tovUnicodeType type, const unsigned int* text, unsigned int n) {
    TOVCheck(Created()->Assign(type, text, n));
}

void ZEBString::Assign(_tovUnicodeType type, ITOVString* source) { TOVCheck(Created()->Assign(type, source)); }

ZEBString& ZEBString::operator+=(const unsigned char* text) {
    Append(text, WithTerminator(text));
    return *this;
}

ZEBString& ZEBString::operator+=(const unsigned short* text) {
    Append(text, WithTerminator(text));
    return *this;
}

ZEBString& ZEBString::operator+=(const unsigned int* text) {
    Append(text, WithTerminator(text));
    return *this;
}

ZEBString& ZEBString::operator+=(ITOVString* text) {
    Append(text);
    return *this;
}

ZEBString& ZEBString::operator+=(const ZEBString& text) { return *this += text.Required(); }

void ZEBString::Append(const unsigned char* text, unsigned int n) { TOVCheck(Required()->Append(text, n)); }

void ZEBString::Append(const unsigned short* text, unsigned int n) { TOVCheck(Required()->Append(text, n)); }

void ZEBString::Append(const unsigned int* text, unsigned int n) { TOVCheck(Required()->Append(text, n)); }

void ZEBString::Append(ITOVString* text) { TOVCheck(Required()->Append(text)); }

void ZEBString::ConvertTo(_tovUnicodeType type) { TOVCheck(Required()->ConvertTo(type)); }

void ZEBString::ToUpper() { TOVCheck(Required()->ToUpper()); }

void ZEBString::ToLower() { TOVCheck(Required()->ToLower()); }

void ZEBString::GetCharacter(unsigned int index, unsigned char* out, unsigned int* size) const {
    TOVCheck(Required()->GetCharacter(index, out, size));
}

void ZEBString::SetCharacter(unsigned int index, const unsigned char* text, unsigned int size) {
    TOVCheck(Required()->SetCharacter(index, text, size));
}

void ZEBString::GetCharacter(unsigned int index, unsigned short* out, unsigned int* size) const {
    TOVCheck(Required()->GetCharacter(index, out, size));
}

void ZEBString::SetCharacter(unsigned int index, const unsigned short* text, unsigned int size) {
    TOVCheck(Required()->SetCharacter(index, text, size));
}

void ZEBString::GetCharacter(unsigned int index, unsigned int* codePoint) const {
    TOVCheck(Required()->GetCharacter(index, codePoint));
}

void ZEBString::SetCharacter(unsigned int index, unsigned int codePoint) {
    TOVCheck(Required()->SetCharacter(index, codePoint));
}

void ZEBString::SetExternalBuffer(_tovUnicodeType type, unsigned char* buffer, unsigned int size) {
    TOVCheck(Created()->SetExternalBuffer(type, buffer, size));
}

void ZEBString::RemoveExternalBuffer(unsigned char** buffer) { TOVCheck(Required()->RemoveExternalBuffer(buffer)); }

const unsigned char* ZEBString::GetUTF8String() const {
    const unsigned char* text = nullptr;
    TOVCheck(Required()->GetUTF8String(&text));
    return text;
}

const unsigned short* ZEBString::GetUTF16String() const {
    const unsigned short* text = nullptr;
    TOVCheck(Required()->GetUTF16String(&text));
    return text;
}

const unsigned int* ZEBString::GetUTF32String() const {
    const unsigned int* text = nullptr;
    TOVCheck(Required()->GetUTF32String(&text));
    return text;
}

wchar_t* ZEBString::GetWCHARString() const {
    wchar_t* text = nullptr;
    TOVCheck(Required()->GetWCHARString(&text));
    return text;
}

uint32_t ZEBString::GetByteCount() const { return Required()->GetByteCount(); }

uint32_t ZEBString::GetCodePointCount() const { return Required()->GetCodePointCount(); }

uint32_t ZEBString::GetNumCharacters() const { return Required()->GetNumCharacters(); }

int ZEBString::IsEmpty() const { return m_pString ? m_pString->IsEmpty() : 1; }

void ZEBString::Clear() {
    if (m_pString) TOVCheck(m_pString->Clear());
}

int ZEBString::Compare(const unsigned char* text, unsigned int n, int caseSensitive) const {
    return CompareWith(Required(), caseSensitive, text, n);
}

int ZEBString::Compare(const unsigned short* text, unsigned int n, int caseSensitive) const {
    return CompareWith(Required(), caseSensitive, text, n);
}

int ZEBString::Compare(const unsigned int* text, unsigned int n, int caseSensitive) const {
    return CompareWith(Required(), caseSensitive, text, n);
}

int ZEBString::Compare(ITOVString* other, int caseSensitive) const {
    return CompareWith(Required(), caseSensitive, other);
}

bool ZEBString::operator==(const unsigned char* text) const { return Compare(text, WithTerminator(text), 1) == 0; }
bool ZEBString::operator==(const unsigned short* text) const { return Compare(text, WithTerminator(text), 1) == 0; }
bool ZEBString::operator==(const unsigned int* text) const { return Compare(text, WithTerminator(text), 1) == 0; }
bool ZEBString::operator==(ITOVString* other) const { return Compare(other, 1) == 0; }
bool ZEBString::operator==(const ZEBString& other) const { return Compare(other.Required(), 1) == 0; }

bool ZEBString::operator!=(const unsigned char* text) const { return Compare(text, WithTerminator(text), 1) != 0; }
bool ZEBString::operator!=(const unsigned short* text) const { return Compare(text, WithTerminator(text), 1) != 0; }
bool ZEBString::operator!=(const unsigned int* text) const { return Compare(text, WithTerminator(text), 1) != 0; }
bool ZEBString::operator!=(ITOVString* other) const { return Compare(other, 1) != 0; }
bool ZEBString::operator!=(const ZEBString& other) const { return Compare(other.Required(), 1) != 0; }

bool ZEBString::operator<(const unsigned char* text) const { return Compare(text, WithTerminator(text), 1) < 0; }
bool ZEBString::operator<(const unsigned short* text) const { return Compare(text, WithTerminator(text), 1) < 0; }
bool ZEBString::operator<(const unsigned int* text) const { return Compare(text, WithTerminator(text), 1) < 0; }
bool ZEBString::operator<(ITOVString* other) const { return Compare(other, 1) < 0; }
bool ZEBString::operator<(const ZEBString& other) const { return Compare(other.Required(), 1) < 0; }

bool ZEBString::operator>(const unsigned char* text) const { return Compare(text, WithTerminator(text), 1) > 0; }
bool ZEBString::operator>(const unsigned short* text) const { return Compare(text, WithTerminator(text), 1) > 0; }
bool ZEBString::operator>(const unsigned int* text) const { return Compare(text, WithTerminator(text), 1) > 0; }
// Not a typo for `> 0`: against another string the test is "differs".
bool ZEBString::operator>(ITOVString* other) const { return Compare(other, 1) != 0; }
bool ZEBString::operator>(const ZEBString& other) const { return Compare(other.Required(), 1) != 0; }

int ZEBString::FindString(const unsigned char* text, int start) const {
    return Find(Required(), start, text, WithoutTerminator(text));
}

int ZEBString::FindString(const unsigned short* text, int start) const {
    return Find(Required(), start, text, WithoutTerminator(text));
}

int ZEBString::FindString(const unsigned int* text, int start) const {
    return Find(Required(), start, text, WithoutTerminator(text));
}

int ZEBString::FindString(ITOVString* text, int start) const { return Find(Required(), start, text); }

int ZEBString::FindStringReverse(const unsigned char* text, int start) const {
    return FindReverse(Required(), start, text, WithoutTerminator(text));
}

int ZEBString::FindStringReverse(const unsigned short* text, int start) const {
    return FindReverse(Required(), start, text, WithoutTerminator(text));
}

int ZEBString::FindStringReverse(const unsigned int* text, int start) const {
    return FindReverse(Required(), start, text, WithoutTerminator(text));
}

int ZEBString::FindStringReverse(ITOVString* text, int start) const { return FindReverse(Required(), start, text); }

ZEBString operator+(const ZEBString& left, const ZEBString& right) { return Concatenate(left, right); }

ZEBString operator+(const ZEBString& left, const unsigned char* right) { return Concatenate(left, right); }

ZEBString operator+(const ZEBString& left, const unsigned short* right) { return Concatenate(left, right); }

ZEBString operator+(const ZEBString& left, const unsigned int* right) { return Concatenate(left, right); }

ZEBString operator+(const unsigned char* left, const ZEBString& right) { return Concatenate(left, right); }

ZEBString operator+(const unsigned short* left, const ZEBString& right) { return Concatenate(left, right); }

ZEBString operator+(const unsigned int* left, const ZEBString& right) { return Concatenate(left, right); }

}  // namespace ZEB
