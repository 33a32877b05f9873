#pragma once
/// Which supported chunk an identifier names.
#include <string>

namespace Orlo {

/// The bit of the kChunkTable row for `id`, or 0 for an unknown chunk.
/// Whole, case-sensitive matches only: "FMT " or "ixml" are unknown.
unsigned int ConvertStrToChunkType(const std::string& id);

}  // namespace Orlo
