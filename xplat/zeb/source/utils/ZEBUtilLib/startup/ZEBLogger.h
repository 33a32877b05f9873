#pragma once
/// Writes messages to the host's console, each line prefixed with the logger's
/// name. Formatting is the console's: the caller's arguments are formatted
/// against the wide form of the format, where `%s` takes UTF-8 text.
#include <cstdint>
#include <string>

#include "tov/ITOVConsole.h"
#include "tov/ITOVString.h"

namespace ZEB {

class ZEBLogger {
public:
    /// A null name gives a logger without prefix.
    explicit ZEBLogger(ITOVString* name = nullptr);
    ~ZEBLogger();

    ZEBLogger(const ZEBLogger&) = delete;
    ZEBLogger& operator=(const ZEBLogger&) = delete;

    /// Copies the name as UTF-8; `name` is converted in place and back to its
    /// own encoding. A failing string operation is thrown as its result.
    void SetName(ITOVString* name);
    /// Levels are the console's decision: these two keep nothing.
    void SetLogLevel(unsigned int level);
    unsigned int GetLogLevel() const;

    /// Writes one line: "name: " (when named), the format, a line feed. Needs
    /// the library to be started: nothing may log before ZEBInitialize.
    void Write(_tovDebugLevel level, const unsigned char* format, ...);
    /// UTF-8 as well, so that plain string literals need no cast.
    void Write(_tovDebugLevel level, const char* format, ...);
    void Write(_tovDebugLevel level, const unsigned short* format, ...);
    void Write(_tovDebugLevel level, const unsigned int* format, ...);
    void Write(_tovDebugLevel level, const wchar_t* format, ...);

private:
    std::wstring BuildLine(std::wstring format) const;

    /// Owned, zero-terminated UTF-8; null for no name.
    char* m_Name = nullptr;
};

}  // namespace ZEB
