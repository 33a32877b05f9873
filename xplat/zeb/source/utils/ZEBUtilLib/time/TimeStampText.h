#pragma once
/// Time stamps as text and back, in ZEB::AAFUtils. Every function that makes
/// or reads a ZEBString needs the library started; failures are thrown.
#include "aaf/AAFTypes.h"
#include "strings/ZEBString.h"

namespace ZEB {
namespace AAFUtils {

/// "YYYY-MM-DD hh:mm:ss", UTF-8.
ZEBString TimeStamptoString(const _aafTimeStamp_t& stamp);
/// "YYYY-MM-DDThh:mm:ssZ", UTF-8.
ZEBString TimeStampToStringUTC(const _aafTimeStamp_t& stamp);
/// "YYYY-MM-DDThh:mm:ss", UTF-8; the value is written as it stands, not shifted.
ZEBString TimeStampToStringLocal(const _aafTimeStamp_t& stamp);
/// Returns `stamp` unchanged: stamps are kept as they were written.
_aafTimeStamp_t TimeStampLocalFromUTC(const _aafTimeStamp_t& stamp);
/// Reads the fixed places of "YYYY-MM-DDThh:mm:ssZ" (the "Z" is not required);
/// fraction 0. A text shorter than 17 characters throws std::out_of_range.
_aafTimeStamp_t TimeStampFromStringUTC(const ZEBString& text);
/// The first 10 characters of `text`, the date of a stamp text, in UTF-8.
ZEBString TimeStampToDate(const ZEBString& text);

}  // namespace AAFUtils
}  // namespace ZEB
