#pragma once
/// Looking up one keyword of a `bext` Description.
#include <string>

#include "reader/BEXTChunk.h"

namespace OrloReader {

/// The value of `key` among the Description keywords; false when `bext` is
/// null or has no such keyword, and `value` is then left alone.
bool FindBextKeyword(const Chunks::BEXT::BEXTChunk* bext, const char* key, std::string& value);

}  // namespace OrloReader
