#include "startup/ZEBLogger.h"

#include <cstring>
#include <string>

#include "startup/ZEBUtilLib.h"
#include "strings/UTFConversions.h"
#include "tov/sdk/TOVFailureStyle.h"

namespace ZEB {

ZEBLogger::ZEBLogger(ITOVString* name) {
    if (name) SetName(name);
}

ZEBLogger::~ZEBLogger() { delete[] m_Name; }

void ZEBLogger::SetName(ITOVString* name) {
    delete[] m_Name;
    m_Name = nullptr;
    const _tovUnicodeType original = name->GetUnicodeType();
    TOVCheck(name->ConvertTo(kTOVUnicodeUTF8));
    const unsigned char* text = nullptr;
    TOVCheck(name->GetUTF8String(&text));
    // The byte count leaves out the terminator, so the copy adds one.
    const uint32_t bytes = name->GetByteCount();
    m_Name = new char[bytes + 1];
    std::memcpy(m_Name, text, bytes);
    m_Name[bytes] = '\0';
    TOVCheck(name->ConvertTo(original));
}

void ZEBLogger::SetLogLevel(unsigned int) {}

unsigned int ZEBLogger::GetLogLevel() const { return 0; }

std::wstring ZEBLogger::BuildLine(std::wstring format) const {
    std::wstring line;
    if (m_Name) {
        line += fromUTF8(reinterpret_cast<const unsigned char*>(m_Name));
        line += L": ";
    }
    line += format;
    line += L'\n';
    return line;
}

// The line is built before the argument list starts, so a throw while building
// it never skips va_end.
#define ZEB_LOGGER_WRITE(FORMAT_EXPR)                         \
    const std::wstring line = BuildLine(FORMAT_EXPR);         \
    va_list args;                                             \
    va_start(args, format);                                   \
    ZEBUtilLib::gpConsole->PrintV(level, line.c_str(), args); \
    va_end(args)

void ZEBLogger::Write(_tovDebugLevel level, const char* format, ...) {
    ZEB_LOGGER_WRITE(fromUTF8(reinterpret_cast<const unsigned char*>(format)));
}

void ZEBLogger::Write(_tovDebugLevel level, const unsigned char* format, ...) { ZEB_LOGGER_WRITE(fromUTF8(format)); }

void ZEBLogger::Write(_tovDebugLevel level, const unsigned short* format, ...) { ZEB_LOGGER_WRITE(fromUTF16(format)); }

void ZEBLogger::Write(_tovDebugLevel level, const unsigned int* format, ...) { ZEB_LOGGER_WRITE(fromUTF32(format)); }

void ZEBLogger::Write(_tovDebugLevel level, const wchar_t* format, ...) { ZEB_LOGGER_WRITE(format); }

#undef ZEB_LOGGER_WRITE

}  // namespace ZEB
