#pragma once
/// Path standardising in place, for the AAF helpers.
#include "strings/ZEBString.h"

namespace ZEB {
namespace AAFUtils {

/// Converts `path` to wide text (encoding 4) and rewrites each backslash to a
/// slash in its own storage. Unlike ZEBStringUtils::StandardizePath, no copy.
void StandardizePath(ZEBString& path);

}  // namespace AAFUtils
}  // namespace ZEB
