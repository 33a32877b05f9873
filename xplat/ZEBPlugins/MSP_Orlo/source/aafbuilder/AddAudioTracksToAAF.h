#pragma once
/// The audio slots of a single-file clip on its three Mobs: the Master Mob's
/// channels, the file Source Mob's one slot, and the tape or import Source
/// Mob's slots that end the chain.
#include "aaf/AAF.h"
#include "clipmodel/Movie.h"
#include "tov/TOVResult.h"

namespace ZEB {
namespace Impl {

/// Makes the slots after `timecodeCount` + `audioCount` slots and adds one to
/// `audioCount` for each Master slot. The Movie's last audio track describes
/// the clip, and `pcm` is filled from its media (a failure there is ignored).
/// Returns 0 or a result code: TOV_E_UNEXPECTED for a track without media or
/// a Movie without an audio track. Slots already made stay when a later step
/// fails. Never throws.
TOVRESULT AddAudioTracksToAAF(OrloReader::Movie* movie, int startingTrackIndex, int& timecodeCount, int& audioCount,
                              const _aafRational_t& editRate, long long startOffset, IAAFDictionary* dictionary,
                              IAAFMob* masterMob, IAAFMasterMob* master, IAAFMob* fileMob, IAAFSourceMob* file,
                              IAAFMob* tapeMob, IAAFSourceMob* tape, IAAFPCMDescriptor* pcm);

}  // namespace Impl
}  // namespace ZEB
