#pragma once
/// Conversions of zero-terminated encoded text to and from standard wide strings.
/// Malformed input ends in std::range_error; nothing here catches.
#include <string>

namespace ZEB {

/// UTF-8 to wide, largest code point 0x10FFFF.
std::wstring fromUTF8(const unsigned char* text);
/// The same conversion; the result replaces `out`'s content.
void wFromUTF8(const char* text, std::wstring& out);
/// Native 16-bit units decoded as little-endian UTF-16, largest code point
/// 0x10FFFF, no byte order mark handling.
std::wstring fromUTF16(const unsigned short* text);
/// Copies 32-bit units up to the terminator with no decoding.
std::wstring fromUTF32(const unsigned int* text);
/// Wide to UTF-8; a unit above 0x10FFFF ends in std::range_error.
std::string wToUTF8(const std::wstring& text);
/// The same for zero-terminated text; the result replaces `out`'s content.
void wToUTF8(const wchar_t* text, std::string& out);

}  // namespace ZEB
