#pragma once
/// File names as the group scan reads them: UTF-8 bytes, counted in
/// characters the way the host's strings count them.
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include "strings/ZEBString.h"

namespace Grouping {

/// The UTF-8 bytes of `text`; empty for a string that is empty or was never made.
std::string UTF8Name(const ZEB::ZEBString& text);

/// A string holding `utf8` in UTF-8.
ZEB::ZEBString NameText(const std::string& utf8);

/// The number of characters in `bytes`, or nothing when they are not
/// well-formed UTF-8 (overlong or cut sequences, stray continuation bytes,
/// surrogates, values above 0x10FFFF): text the host's strings refuse.
std::optional<uint32_t> CountUTF8Characters(std::string_view bytes);

}  // namespace Grouping
