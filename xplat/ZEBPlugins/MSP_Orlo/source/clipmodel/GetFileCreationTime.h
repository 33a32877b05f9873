#pragma once
/// When a file was made, in local time.
#include "aaf/AAFTypes.h"
#include "strings/ZEBString.h"

namespace OrloReader {

/// Fills `out` with the file's creation time in the local time zone, fraction
/// 0. On Linux that is the birth time where the file system records one, else
/// the time of the last change of content. A file that cannot be examined
/// leaves `out` as it was. Always reports success.
bool GetFileCreationTime(const ZEB::ZEBString& path, _aafTimeStamp_t* out);

}  // namespace OrloReader
