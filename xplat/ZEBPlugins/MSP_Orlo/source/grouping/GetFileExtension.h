#pragma once
/// The extension of a file name, with its dot.
#include "strings/ZEBString.h"

namespace HelperFunctions {

/// The name's last dot and what follows it (".wav" for take.wav), in UTF-8;
/// an empty string when the name has no dot.
ZEB::ZEBString GetFileExtension(const ZEB::ZEBString& name);

}  // namespace HelperFunctions
