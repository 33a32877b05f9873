#pragma once
/// The host's console: formatted message lines at a debug level.
#include <cstdarg>
#include <cstdint>

#include "tov/ITOVUnknown.h"

inline constexpr _tovUID IID_ITOVConsole = {
    0x908C3A6B, 0xF119, 0x11D6, {0xAD, 0x24, 0x00, 0x03, 0x93, 0x83, 0x00, 0x8C}};

/// Single bits, passed to the console as they stand.
enum _tovDebugLevel : uint32_t {
    kTOVDebugLevelError = 1,      ///< a failure
    kTOVDebugLevelWarning = 2,    ///< a problem that the work goes on after
    kTOVDebugLevelException = 4,  ///< an exception caught at a method's edge
    kTOVDebugLevelTrace = 8,      ///< progress trace
    kTOVDebugLevelStartup = 16,   ///< library start-up
};

/// Formats follow the standard wide printf functions: `%s` takes a narrow
/// UTF-8 string. Whether a level is shown is the console's decision.
class ITOVConsole : public ITOVUnknown {
public:
    /// Writes a finished text.
    virtual TOVRESULT Write(uint32_t level, const wchar_t* text) = 0;
    virtual TOVRESULT Print(uint32_t level, const wchar_t* format, ...) = 0;
    /// As `Print`, with a narrow UTF-8 format.
    virtual TOVRESULT PrintNarrow(uint32_t level, const char* format, ...) = 0;
    virtual TOVRESULT PrintV(uint32_t level, const wchar_t* format, va_list args) = 0;
    /// The set of level bits that are shown.
    virtual TOVRESULT SetVerbosity(uint32_t levelMask) = 0;
    virtual uint32_t GetVerbosity() = 0;

protected:
    ~ITOVConsole() = default;
};
