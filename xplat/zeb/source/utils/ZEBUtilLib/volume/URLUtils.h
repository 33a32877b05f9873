#pragma once
/// File paths as file URLs and back: the form a network locator holds.
///
/// A path becomes "file://" plus the path (or "file:" plus a path that begins
/// with two separators, which names a server), with both separators written as
/// slashes and the characters of `kCharactersNeedingEscape` as "%XX". Every
/// other character passes unchanged, non-ASCII ones too: they are not written
/// as escapes of their UTF-8 bytes. The way back turns each "%XX" into one
/// character of that value.
///
/// None of these functions throws: failures of the string component come back
/// as their result, anything else as TOV_E_UNEXPECTED.
#include "strings/ZEBString.h"
#include "tov/ITOVString.h"
#include "tov/TOVResult.h"

namespace ZEB {

/// Blank < > # % { } | \ ^ ~ [ ] ` ( ) ! * + $ , ; / ? : @ = & in this order:
/// ":" is escaped, "." is not.
extern const wchar_t kCharactersNeedingEscape[];

/// The URL of `path` as a new string in encoding 4 in `*out`, owned by the
/// caller. TOV_E_INVALIDARG for a null argument or an empty path.
TOVRESULT MakeURLPathFromFilePath(ITOVString* path, ITOVString** out);

namespace AAFUtils {

/// The path behind "file:///" in `url`: the first eight bytes of its UTF-8
/// text are dropped wherever that prefix stands, so the result has no leading
/// slash. TOV_E_INVALIDARG for an empty URL or one without the prefix.
TOVRESULT MakeFilePathFromURLPath(const ZEBString& url, ZEBString& path);
/// The escapes of `url` decoded, with no prefix handling. TOV_E_INVALIDARG for
/// an empty URL.
TOVRESULT MakeFilePathFromPartialURLPath(const ZEBString& url, ZEBString& path);

}  // namespace AAFUtils
}  // namespace ZEB
