#include "time/ConvertTime.h"

#include <cstring>
#include <ctime>

#include "strings/ZEBString.h"
#include "time/TimeStampPlaces.h"
#include "tov/sdk/TOVFailureStyle.h"

namespace ZEB {

TOVRESULT ConvertTime(long t, _aafTimeStamp_t* out) {
    if (!out) return TOV_E_INVALIDARG;
    const std::time_t moment = t;
    std::tm parts{};
    std::memset(out, 0, sizeof *out);
    if (!gmtime_r(&moment, &parts)) return TOV_E_INVALIDARG;
    out->date.year = static_cast<aafInt16>(parts.tm_year + 1900);
    out->date.month = static_cast<aafUInt8>(parts.tm_mon + 1);
    out->date.day = static_cast<aafUInt8>(parts.tm_mday);
    return TOV_OK;
}

TOVRESULT ConvertTimeString(ITOVString* text, _aafTimeStamp_t* out) {
    if (!out) return TOV_E_INVALIDARG;
    return TOVGuarded([&] {
        const ZEBString utf8(kTOVUnicodeUTF8, text);
        ReadTimeStampPlaces(reinterpret_cast<const char*>(utf8.GetUTF8String()), *out);
        return TOV_OK;
    });
}

}  // namespace ZEB
