#pragma once
/// The clip of a Movie as the container hands it to the host.
#include "aaf/AAF.h"
#include "clipmodel/Movie.h"
#include "strings/ZEBString.h"
#include "tov/ITOVComponentFactory.h"
#include "tov/TOVResult.h"

namespace ZEB {
namespace Impl {

/// Builds the transient AAF file of `movie` into `*out` (the caller's
/// reference). Returns 0 or a result code; never throws.
TOVRESULT NewAAFFromMovie(OrloReader::Movie* movie, const ZEBString& path, IAAFFile** out,
                          ITOVComponentFactory* factory);

}  // namespace Impl
}  // namespace ZEB
