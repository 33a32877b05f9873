#include "time/TimeStampText.h"

#include <cstdio>

#include "strings/ZEBStringUtils.h"
#include "time/TimeStampPlaces.h"

namespace ZEB {
namespace AAFUtils {
namespace {

// A negative year prints as its unsigned value, and the buffer of 30 bytes
// (one size for all three forms) cuts what does not fit; both are kept.
ZEBString Format(const char* format, const _aafTimeStamp_t& stamp) {
    char text[30];
    std::snprintf(text, sizeof text, format, static_cast<unsigned int>(stamp.date.year),
                  static_cast<unsigned int>(stamp.date.month), static_cast<unsigned int>(stamp.date.day),
                  static_cast<unsigned int>(stamp.time.hour), static_cast<unsigned int>(stamp.time.minute),
                  static_cast<unsigned int>(stamp.time.second));
    return ZEBString(reinterpret_cast<const unsigned char*>(text));
}

}  // namespace

ZEBString TimeStamptoString(const _aafTimeStamp_t& stamp) { return Format("%04u-%02u-%02u %02u:%02u:%02u", stamp); }

ZEBString TimeStampToStringUTC(const _aafTimeStamp_t& stamp) { return Format("%04u-%02u-%02uT%02u:%02u:%02uZ", stamp); }

ZEBString TimeStampToStringLocal(const _aafTimeStamp_t& stamp) {
    return Format("%04u-%02u-%02uT%02u:%02u:%02u", stamp);
}

_aafTimeStamp_t TimeStampLocalFromUTC(const _aafTimeStamp_t& stamp) { return stamp; }

_aafTimeStamp_t TimeStampFromStringUTC(const ZEBString& text) {
    const ZEBString utf8(kTOVUnicodeUTF8, text.InArg());
    _aafTimeStamp_t stamp{};
    ReadTimeStampPlaces(reinterpret_cast<const char*>(utf8.GetUTF8String()), stamp);
    return stamp;
}

ZEBString TimeStampToDate(const ZEBString& text) {
    return ZEBStringUtils::GetUTF8ZEBString(ZEBStringUtils::GetSubString(text, 0, 10));
}

}  // namespace AAFUtils
}  // namespace ZEB
