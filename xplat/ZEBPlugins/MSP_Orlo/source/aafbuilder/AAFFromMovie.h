#pragma once
/// The clip of a Movie whose audio lies in one file, as a transient AAF file:
/// a Master Mob whose slots refer to a file Source Mob, which refers to a tape
/// or import Source Mob carrying the timecode and a slot for every channel.
#include "aaf/AAF.h"
#include "clipmodel/Movie.h"
#include "strings/ZEBString.h"
#include "tov/ITOVComponentFactory.h"
#include "tov/TOVResult.h"

namespace ZEB {
namespace Impl {

/// Builds the clip of `movie`, whose file lies at `path`, and hands the file
/// to `*out` (the caller's reference). `factory` is not used. Returns 0 or a
/// result code and never throws; TOV_E_INVALIDARG for a null `out`, a null
/// `movie` or an empty path, tested in that order. On a failure `*out` stays
/// as it was, and a transient file already opened stays allocated.
TOVRESULT AAFFromMovie(OrloReader::Movie* movie, const ZEBString& path, IAAFFile** out, ITOVComponentFactory* factory);

}  // namespace Impl
}  // namespace ZEB
