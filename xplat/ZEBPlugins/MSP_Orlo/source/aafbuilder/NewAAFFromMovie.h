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
/// reference): the grouped clip for a Movie that the group scan made, else
/// the single-file clip. Returns 0 or a result code; never throws.
TOVRESULT NewAAFFromMovie(OrloReader::Movie* movie, const ZEBString& path, IAAFFile** out,
                          ITOVComponentFactory* factory);

}  // namespace Impl
}  // namespace ZEB
