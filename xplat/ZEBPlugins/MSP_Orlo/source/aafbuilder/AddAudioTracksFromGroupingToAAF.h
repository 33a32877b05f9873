#pragma once
/// The audio slots of a grouped clip: one file Source Mob per member file,
/// each with one slot, the Master Mob's slots leading to them, and the tape or
/// import Source Mob's slots up to the highest channel.
#include <tuple>
#include <vector>

#include "aaf/AAF.h"
#include "aafbuilder/IAAFSmartPointer.h"
#include "clipmodel/Movie.h"
#include "tov/TOVResult.h"

namespace ZEB {
namespace Impl {

/// The file Source Mobs of a group, one per audio track, in track order.
using GroupFileMobs = std::vector<std::tuple<IAAFSmartPointer<IAAFMob>, IAAFSmartPointer<IAAFSourceMob>>>;
/// The descriptors of the files that got their slots, kept referenced until
/// the build ends.
using GroupDescriptors =
    std::vector<std::tuple<IAAFSmartPointer<IAAFEssenceDescriptor>, IAAFSmartPointer<IAAFPCMDescriptor>>>;

/// Makes the slots after `timecodeCount` + `audioCount` slots (B), in the
/// order of the Movie's audio tracks and their ascending channel indices c:
/// tape slots B + 1 .. B + the highest c, each with the physical number of
/// the file it was made for (so the slots of a gap carry the next file's);
/// for each file its one slot B + 1, named "A<c>", on its file Mob, and the
/// Master slot that leads to it, every slot `groupLength` long at
/// `editRate`; the file's descriptor with its own locator. A file whose
/// channel index is not above the one before gets nothing and leaves the
/// last file Mob empty. Neither counter changes; `startingTrackIndex` is
/// not used. Returns 0 or a result code (TOV_E_UNEXPECTED for a track
/// without media); never throws.
TOVRESULT AddAudioTracksFromGroupingToAAF(OrloReader::Movie* movie, int startingTrackIndex, unsigned int& timecodeCount,
                                          unsigned int& audioCount, const _aafRational_t& editRate,
                                          long long startOffset, long long groupLength, IAAFDictionary* dictionary,
                                          IAAFMob* masterMob, IAAFMasterMob* master, GroupFileMobs& fileMobs,
                                          IAAFMob* tapeMob, IAAFSourceMob* tape, GroupDescriptors& descriptors);

}  // namespace Impl
}  // namespace ZEB
