#pragma once
/// Formatting and output of the host's console lines.
#include <cstdarg>
#include <cstdint>
#include <functional>
#include <string>

#include "tov/TOVResult.h"

class HostConsole {
public:
    /// Receives each shown message as UTF-8, its trailing line feed removed.
    using Sink = std::function<void(uint32_t level, const std::string& line)>;

    /// Failures, warnings, caught exceptions and start-up are shown; traces are not.
    static constexpr uint32_t kDefaultVerbosity = 1 | 2 | 4 | 16;

    /// Writes to stderr until another sink is set.
    HostConsole();

    void SetSink(Sink sink) { m_Sink = std::move(sink); }
    void SetVerbosity(uint32_t levelMask) { m_Verbosity = levelMask; }
    uint32_t GetVerbosity() const { return m_Verbosity; }
    /// Whether a message at `level` is shown: any of its bits is in the mask.
    bool Shows(uint32_t level) const { return (level & m_Verbosity) != 0; }

    TOVRESULT Write(uint32_t level, const wchar_t* text);
    /// Formats a wide printf format with vswprintf under a UTF-8 locale, so that
    /// `%s` takes UTF-8 text. A message that cannot be formatted (a bad
    /// conversion or malformed UTF-8 in an argument) is TOV_E_INVALIDARG.
    TOVRESULT PrintV(uint32_t level, const wchar_t* format, va_list args);
    /// As PrintV with a narrow UTF-8 format.
    TOVRESULT PrintNarrowV(uint32_t level, const char* format, va_list args);

    static TOVRESULT FormatWide(const wchar_t* format, va_list args, std::wstring& out);

private:
    void Emit(uint32_t level, std::string line);

    Sink m_Sink;
    uint32_t m_Verbosity = kDefaultVerbosity;
};
