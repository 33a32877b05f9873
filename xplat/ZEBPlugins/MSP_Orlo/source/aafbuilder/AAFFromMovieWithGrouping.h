#pragma once
/// The clip of a Movie that the group scan gathered from several one-channel
/// files: as the single-file clip, but with a file Source Mob for each member,
/// so that the Master Mob's slots lead to different files.
#include "aaf/AAF.h"
#include "clipmodel/Movie.h"
#include "strings/ZEBString.h"
#include "tov/ITOVComponentFactory.h"
#include "tov/TOVResult.h"

namespace ZEB {
namespace Impl {

/// As AAFFromMovie, with its arguments and results. The file Mobs are named
/// by the tape ID and identified by the Movie's identity with 0xB1 + i in
/// byte 13 (wrapping after the 79th); each member's descriptor is located at
/// the member's own path, the tape or import Mob's at `path`.
TOVRESULT AAFFromMovieWithGrouping(OrloReader::Movie* movie, const ZEBString& path, IAAFFile** out,
                                   ITOVComponentFactory* factory);

}  // namespace Impl
}  // namespace ZEB
