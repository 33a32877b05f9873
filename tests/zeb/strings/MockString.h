#pragma once
/// A string component whose calls can be inspected: the counts and flags that
/// ZEBString hands over are invisible through a real string.
#include <gmock/gmock.h>

#include "tov/ITOVString.h"

class MockString : public ITOVString {
public:
    MockString() {
        ON_CALL(*this, AddRef()).WillByDefault(::testing::Return(1u));
        ON_CALL(*this, Release()).WillByDefault(::testing::Return(0u));
    }
    virtual ~MockString() = default;

    MOCK_METHOD(TOVRESULT, QueryInterface, (const _tovUID& iid, void** out), (override));
    MOCK_METHOD(uint32_t, AddRef, (), (override));
    MOCK_METHOD(uint32_t, Release, (), (override));

    MOCK_METHOD(TOVRESULT, Assign, (_tovUnicodeType type, ITOVString* source), (override));
    MOCK_METHOD(TOVRESULT, Assign, (_tovUnicodeType type, const unsigned char* text, unsigned int n), (override));
    MOCK_METHOD(TOVRESULT, Assign, (_tovUnicodeType type, const unsigned short* text, unsigned int n), (override));
    MOCK_METHOD(TOVRESULT, Assign, (_tovUnicodeType type, const unsigned int* text, unsigned int n), (override));
    MOCK_METHOD(TOVRESULT, Assign, (_tovUnicodeType type, const wchar_t* text, unsigned int n), (override));
    MOCK_METHOD(TOVRESULT, ConvertTo, (_tovUnicodeType type), (override));
    MOCK_METHOD(TOVRESULT, ToLower, (), (override));
    MOCK_METHOD(TOVRESULT, ToUpper, (), (override));
    MOCK_METHOD(TOVRESULT, ConvertedCopy, (_tovUnicodeType type, ITOVString** out), (override));

    MOCK_METHOD(TOVRESULT, Append, (ITOVString * text), (override));
    MOCK_METHOD(TOVRESULT, Append, (const unsigned char* text, unsigned int n), (override));
    MOCK_METHOD(TOVRESULT, Append, (const unsigned short* text, unsigned int n), (override));
    MOCK_METHOD(TOVRESULT, Append, (const unsigned int* text, unsigned int n), (override));
    MOCK_METHOD(TOVRESULT, Append, (const wchar_t* text, unsigned int n), (override));

    MOCK_METHOD(TOVRESULT, GetUTF8String, (const unsigned char** out), (override));
    MOCK_METHOD(TOVRESULT, GetUTF16String, (const unsigned short** out), (override));
    MOCK_METHOD(TOVRESULT, GetUTF32String, (const unsigned int** out), (override));
    MOCK_METHOD(TOVRESULT, GetWCHARString, (wchar_t * *out), (override));
    MOCK_METHOD(uint32_t, GetByteCount, (), (override));
    MOCK_METHOD(uint32_t, GetCodePointCount, (), (override));
    MOCK_METHOD(uint32_t, GetNumCharacters, (), (override));

    MOCK_METHOD(TOVRESULT, Compare, (ITOVString * other, int* result, int caseSensitive), (override));
    MOCK_METHOD(TOVRESULT, Compare, (const unsigned char* text, unsigned int n, int* result, int caseSensitive),
                (override));
    MOCK_METHOD(TOVRESULT, Compare, (const unsigned short* text, unsigned int n, int* result, int caseSensitive),
                (override));
    MOCK_METHOD(TOVRESULT, Compare, (const unsigned int* text, unsigned int n, int* result, int caseSensitive),
                (override));
    MOCK_METHOD(TOVRESULT, Compare, (const wchar_t* text, unsigned int n, int* result, int caseSensitive), (override));

    MOCK_METHOD(TOVRESULT, FindString, (ITOVString * text, int start, int* position), (override));
    MOCK_METHOD(TOVRESULT, FindString, (const unsigned char* text, unsigned int n, int start, int* position),
                (override));
    MOCK_METHOD(TOVRESULT, FindString, (const unsigned short* text, unsigned int n, int start, int* position),
                (override));
    MOCK_METHOD(TOVRESULT, FindString, (const unsigned int* text, unsigned int n, int start, int* position),
                (override));
    MOCK_METHOD(TOVRESULT, FindString, (const wchar_t* text, unsigned int n, int start, int* position), (override));
    MOCK_METHOD(TOVRESULT, FindStringReverse, (ITOVString * text, int start, int* position), (override));
    MOCK_METHOD(TOVRESULT, FindStringReverse, (const unsigned char* text, unsigned int n, int start, int* position),
                (override));
    MOCK_METHOD(TOVRESULT, FindStringReverse, (const unsigned short* text, unsigned int n, int start, int* position),
                (override));
    MOCK_METHOD(TOVRESULT, FindStringReverse, (const unsigned int* text, unsigned int n, int start, int* position),
                (override));
    MOCK_METHOD(TOVRESULT, FindStringReverse, (const wchar_t* text, unsigned int n, int start, int* position),
                (override));

    MOCK_METHOD(TOVRESULT, GetCharacter, (unsigned int index, unsigned char* out, unsigned int* size), (override));
    MOCK_METHOD(TOVRESULT, SetCharacter, (unsigned int index, const unsigned char* text, unsigned int size),
                (override));
    MOCK_METHOD(TOVRESULT, GetCharacter, (unsigned int index, unsigned short* out, unsigned int* size), (override));
    MOCK_METHOD(TOVRESULT, SetCharacter, (unsigned int index, const unsigned short* text, unsigned int size),
                (override));
    MOCK_METHOD(TOVRESULT, GetCharacter, (unsigned int index, unsigned int* codePoint), (override));
    MOCK_METHOD(TOVRESULT, SetCharacter, (unsigned int index, unsigned int codePoint), (override));
    MOCK_METHOD(TOVRESULT, Truncate, (unsigned int count), (override));

    MOCK_METHOD(TOVRESULT, SetExternalBuffer, (_tovUnicodeType type, unsigned char* buffer, unsigned int size),
                (override));
    MOCK_METHOD(TOVRESULT, RemoveExternalBuffer, (unsigned char** buffer), (override));
    MOCK_METHOD(_tovUnicodeType, GetUnicodeType, (), (override));
    MOCK_METHOD(int, IsEmpty, (), (override));
    MOCK_METHOD(TOVRESULT, Clear, (), (override));
};
