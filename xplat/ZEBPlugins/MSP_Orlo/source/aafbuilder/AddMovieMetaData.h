#pragma once
/// What the Movie knows of a recording, written on the Master Mob as comments
/// that the host shows in its bin columns. Nothing here reports a failure: a
/// comment that cannot be written is left out and the next one follows.
#include <string>

#include "aaf/AAF.h"
#include "clipmodel/Movie.h"

namespace ZEB {
namespace Impl {

/// The comments in their fixed order: Comments, UBITS, TapeID, Shoot Date,
/// Scene, Take, the TRK names by number, User, Digitizer sample rate,
/// Production, Circled, Wild Track, False Start, No Good, and off tape
/// Soundroll and Soundroll TC Rate.
void AddMovieMetaData(IAAFMob* mob, OrloReader::Movie* movie);

/// Appends the comment `name` with `value` (both UTF-8) to `mob`, if there is one.
void AddCustomColumnEntry(IAAFMob* mob, const std::string& name, const std::string& value);

}  // namespace Impl
}  // namespace ZEB
