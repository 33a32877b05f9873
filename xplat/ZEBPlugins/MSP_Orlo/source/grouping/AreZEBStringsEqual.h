#pragma once
/// Equality of two strings by the host's comparison.
#include "strings/ZEBString.h"

namespace HelperFunctions {

/// False when either string is empty; otherwise whether the host compares
/// their UTF-8 forms as equal, `flags` 1 making letter case count.
bool AreZEBStringsEqual(const ZEB::ZEBString& a, const ZEB::ZEBString& b, int flags);

}  // namespace HelperFunctions
