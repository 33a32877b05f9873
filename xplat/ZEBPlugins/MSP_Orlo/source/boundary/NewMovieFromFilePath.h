#pragma once
/// Making the Movie of one file, as the container does for the host.
#include "clipmodel/Movie.h"
#include "strings/ZEBString.h"
#include "tov/ITOVComponentFactory.h"

namespace ZEB {
namespace Impl {

/// Reads the host's grouping setting and fills a new Movie from `path`.
/// Returns 0 and the Movie in `*out` (the caller owns it), or a result code
/// and null. Never throws.
TOVRESULT NewMovieFromFilePath(const ZEBString& path, OrloReader::Movie** out, ITOVComponentFactory* factory);

}  // namespace Impl
}  // namespace ZEB
