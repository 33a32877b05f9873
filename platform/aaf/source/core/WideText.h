#pragma once
/// Wide strings in and out of callers' buffers, with the sizes in bytes that
/// the interface counts, the terminating null included.
#include <string>

#include "aaf/AAFTypes.h"

namespace aafmodel {

/// The buffer size in bytes that `text` needs.
aafUInt32 WideBufLen(const std::wstring& text);
/// Copies `text` with its null into `buffer` of `bufSize` bytes; throws
/// AAFRESULT_SMALLBUF when it does not fit and AAFRESULT_NULL_PARAM for a null buffer.
void CopyWide(const std::wstring& text, aafCharacter* buffer, aafUInt32 bufSize);
/// A caller's string; throws AAFRESULT_NULL_PARAM for null.
std::wstring WideArg(aafCharacter_constptr text);

}  // namespace aafmodel
