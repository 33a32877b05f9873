#include "clipmodel/GetFileCreationTime.h"

#include <fcntl.h>
#include <sys/stat.h>

#include <ctime>

namespace OrloReader {

bool GetFileCreationTime(const ZEB::ZEBString& path, _aafTimeStamp_t* out) {
    if (out == nullptr || path.IsEmpty()) return true;
    const char* utf8 = reinterpret_cast<const char*>(path.GetUTF8String());
    struct statx info {};
    if (statx(AT_FDCWD, utf8, 0, STATX_BTIME | STATX_MTIME, &info) != 0) return true;
    // Many Linux file systems (and older kernels) keep no birth time; the
    // modification time is the nearest stand-in, and for a recorder's file
    // that was never edited it is the end of the recording.
    const time_t seconds = (info.stx_mask & STATX_BTIME) != 0 ? static_cast<time_t>(info.stx_btime.tv_sec)
                                                              : static_cast<time_t>(info.stx_mtime.tv_sec);
    struct tm local {};
    if (localtime_r(&seconds, &local) == nullptr) return true;
    out->date.year = static_cast<aafInt16>(local.tm_year + 1900);
    out->date.month = static_cast<aafUInt8>(local.tm_mon + 1);
    out->date.day = static_cast<aafUInt8>(local.tm_mday);
    out->time.hour = static_cast<aafUInt8>(local.tm_hour);
    out->time.minute = static_cast<aafUInt8>(local.tm_min);
    out->time.second = static_cast<aafUInt8>(local.tm_sec);
    out->time.fraction = 0;
    return true;
}

}  // namespace OrloReader
