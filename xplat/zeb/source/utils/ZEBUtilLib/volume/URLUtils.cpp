#include "volume/URLUtils.h"

#include <algorithm>
#include <cwchar>
#include <string>

#include "strings/UTFConversions.h"
#include "strings/ZEBStringUtils.h"
#include "tov/sdk/TOVFailureStyle.h"

namespace ZEB {

const wchar_t kCharactersNeedingEscape[] = L" <>#%{}|\\^~[]`()!*+$,;/?:@=&";

namespace {

bool NeedsEscape(wchar_t c) { return c != L'\0' && std::wcschr(kCharactersNeedingEscape, c) != nullptr; }

// A server's name follows two slashes or two backslashes; one of each is no
// such name.
bool StartsWithTwo(const wchar_t* text, wchar_t separator) { return text[0] == separator && text[1] == separator; }

std::wstring EscapedURL(const wchar_t* path) {
    std::wstring url = StartsWithTwo(path, L'/') || StartsWithTwo(path, L'\\') ? L"file:" : L"file://";
    for (const wchar_t* p = path; *p != L'\0'; ++p) {
        if (!NeedsEscape(*p)) {
            url += *p;
        } else if (*p == L'/' || *p == L'\\') {
            url += L'/';
        } else {
            wchar_t escape[4];
            std::swprintf(escape, 4, L"%%%2.2X", static_cast<unsigned int>(*p));
            url += escape;
        }
    }
    return url;
}

// Each "%" and the two units behind it become the one unit that "%2X" reads
// there (0 when it reads nothing); both units are skipped whatever they hold,
// and a "%" near the end skips only what is left.
TOVRESULT DecodeEscapes(const char* utf8, ZEBString& path) {
    std::wstring text;
    wFromUTF8(utf8, text);
    std::wstring decoded;
    decoded.reserve(text.size());
    for (std::size_t i = 0; i < text.size(); ++i) {
        if (text[i] != L'%') {
            decoded += text[i];
            continue;
        }
        unsigned int value = 0;
        std::swscanf(text.c_str() + i + 1, L"%2X", &value);
        decoded += static_cast<wchar_t>(value);
        i += std::min<std::size_t>(2, text.size() - i - 1);
    }
    std::string out;
    wToUTF8(decoded.c_str(), out);
    path = reinterpret_cast<const unsigned char*>(out.c_str());
    return TOV_OK;
}

std::string UTF8Text(const ZEBString& s) {
    return reinterpret_cast<const char*>(ZEBStringUtils::GetUTF8ZEBString(s).GetUTF8String());
}

}  // namespace

TOVRESULT MakeURLPathFromFilePath(ITOVString* path, ITOVString** out) {
    return TOVGuarded([&] {
        if (path == nullptr || out == nullptr) return TOV_E_INVALIDARG;
        ZEBString wide(kTOVUnicodeWCHAR, path);
        if (wide.IsEmpty()) return TOV_E_INVALIDARG;
        ZEBString url = ZEBStringUtils::CreateWCharZEBString(EscapedURL(wide.GetWCHARString()).c_str(), -1);
        ITOVString* result = url.InArg();
        result->AddRef();
        *out = result;
        return TOV_OK;
    });
}

namespace AAFUtils {

TOVRESULT MakeFilePathFromURLPath(const ZEBString& url, ZEBString& path) {
    return TOVGuarded([&] {
        if (url.IsEmpty()) return TOV_E_INVALIDARG;
        const std::string text = UTF8Text(url);
        if (text.find("file:///") == std::string::npos) return TOV_E_INVALIDARG;
        // The first eight bytes of the UTF-8 text go, wherever the prefix
        // stood: the root's slash with them.
        return DecodeEscapes(text.c_str() + 8, path);
    });
}

TOVRESULT MakeFilePathFromPartialURLPath(const ZEBString& url, ZEBString& path) {
    return TOVGuarded([&] {
        if (url.IsEmpty()) return TOV_E_INVALIDARG;
        return DecodeEscapes(UTF8Text(url).c_str(), path);
    });
}

}  // namespace AAFUtils
}  // namespace ZEB
