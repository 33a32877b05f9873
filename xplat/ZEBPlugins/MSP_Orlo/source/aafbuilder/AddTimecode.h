#pragma once
/// The timecode slots of a tape or import Source Mob: a Sequence holding one
/// Timecode, "TC1" for the first timecode track and "AuxTC%d" for the others.
#include "aaf/AAF.h"
#include "tov/TOVResult.h"

namespace ZEB {
namespace Impl {

/// Adds slot `slotIndex` + 1 to `mob` for timecode track `index` (counted
/// from 0). Only a failure to read `mob`'s identifier is returned; a slot
/// that cannot be made is left out and the result is 0. Never throws.
TOVRESULT AddTimecodeAAFTrack(_aafTimecode_t& timecode, unsigned int index, int slotIndex, const _aafRational_t& rate,
                              const long long& length, const long long& total, const long long& start,
                              IAAFDictionary* dictionary, IAAFMob* mob);

/// Appends slot `slotID` named `name` to `mob`: a Sequence of a Timecode of
/// `length`, and for `index` above 0 between a Filler of `start` and one of
/// `total` - `start` - `length`, which may be negative. Returns 0, or the
/// result code of the step that failed; never throws.
TOVRESULT AddTimecode(IAAFDictionary* dictionary, _aafRational_t rate, const wchar_t* name, IAAFMob* mob,
                      unsigned int slotID, long long length, long long total, long long start, _aafTimecode_t& timecode,
                      int index);

}  // namespace Impl
}  // namespace ZEB
