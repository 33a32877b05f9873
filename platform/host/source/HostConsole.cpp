#include "tov/host/HostConsole.h"

#include <locale.h>

#include <clocale>
#include <cstdio>
#include <cwchar>
#include <vector>

#include "tov/host/UTF8Locale.h"
#include "tov/host/UnicodeCodec.h"

namespace {

// vswprintf converts `%s` arguments with the thread's LC_CTYPE; the host's
// UTF-8 locale, current for this thread alone, leaves the process locale untouched.
class ScopedUTF8Locale {
public:
    ScopedUTF8Locale() : m_Locale(UTF8Locale()) {
        if (m_Locale) m_Previous = uselocale(m_Locale);
    }
    ~ScopedUTF8Locale() {
        if (m_Locale) uselocale(m_Previous);
    }
    ScopedUTF8Locale(const ScopedUTF8Locale&) = delete;
    ScopedUTF8Locale& operator=(const ScopedUTF8Locale&) = delete;

private:
    locale_t m_Locale;
    locale_t m_Previous = static_cast<locale_t>(0);
};

}  // namespace

HostConsole::HostConsole()
    : m_Sink([](uint32_t, const std::string& line) { std::fprintf(stderr, "%s\n", line.c_str()); }) {}

TOVRESULT HostConsole::Write(uint32_t level, const wchar_t* text) {
    if (!text) return TOV_E_INVALIDARG;
    if (Shows(level)) Emit(level, UnicodeCodec::EncodeUTF8(text));
    return TOV_OK;
}

TOVRESULT HostConsole::FormatWide(const wchar_t* format, va_list args, std::wstring& out) {
    if (!format) return TOV_E_INVALIDARG;
    ScopedUTF8Locale utf8;
    // vswprintf reports a buffer that is too small and a failed conversion alike,
    // so grow up to a bound and then call the message unformattable.
    constexpr size_t kMaxChars = size_t(1) << 20;
    for (size_t capacity = 256; capacity <= kMaxChars; capacity *= 4) {
        std::vector<wchar_t> buffer(capacity);
        va_list copy;
        va_copy(copy, args);
        const int written = std::vswprintf(buffer.data(), capacity, format, copy);
        va_end(copy);
        if (written >= 0) {
            out.assign(buffer.data(), static_cast<size_t>(written));
            return TOV_OK;
        }
    }
    return TOV_E_INVALIDARG;
}

TOVRESULT HostConsole::PrintV(uint32_t level, const wchar_t* format, va_list args) {
    if (!format) return TOV_E_INVALIDARG;
    if (!Shows(level)) return TOV_OK;
    std::wstring text;
    const TOVRESULT result = FormatWide(format, args, text);
    if (result < 0) return result;
    Emit(level, UnicodeCodec::EncodeUTF8(text));
    return TOV_OK;
}

TOVRESULT HostConsole::PrintNarrowV(uint32_t level, const char* format, va_list args) {
    if (!format) return TOV_E_INVALIDARG;
    if (!Shows(level)) return TOV_OK;
    ScopedUTF8Locale utf8;  // `%ls` arguments are converted to UTF-8
    va_list copy;
    va_copy(copy, args);
    const int length = std::vsnprintf(nullptr, 0, format, copy);
    va_end(copy);
    if (length < 0) return TOV_E_INVALIDARG;
    std::string text(static_cast<size_t>(length) + 1, '\0');
    std::vsnprintf(text.data(), text.size(), format, args);
    text.resize(static_cast<size_t>(length));
    Emit(level, std::move(text));
    return TOV_OK;
}

void HostConsole::Emit(uint32_t level, std::string line) {
    // Messages carry their own line feed; the sink gets lines without it.
    while (!line.empty() && line.back() == '\n') line.pop_back();
    m_Sink(level, line);
}
