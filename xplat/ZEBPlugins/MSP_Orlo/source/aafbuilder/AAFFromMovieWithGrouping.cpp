#include "aafbuilder/AAFFromMovieWithGrouping.h"

#include "aafbuilder/AddAudioTracksFromGroupingToAAF.h"
#include "aafbuilder/CAAFBuiltinDefs.h"
#include "aafbuilder/ClipSteps.h"
#include "aafbuilder/NewMob.h"
#include "aafbuilder/TransientClip.h"
#include "aafbuilder/WideThroughString.h"
#include "tov/sdk/TOVFailureStyle.h"

namespace ZEB {
namespace Impl {

namespace {

using OrloReader::Movie;

// One file Source Mob per audio track. Their identifiers and names are set
// without looking at the results, as they always have been.
GroupFileMobs MakeFileMobs(const Movie& movie, CAAFBuiltinDefs& defs) {
    GroupFileMobs fileMobs;
    const std::wstring name = WideThroughString(movie.GetMovieTapeID());
    for (unsigned int t = 0; t < movie.GetTrackCount(); ++t) {
        const auto track = movie.GetTrack(t);
        // A track without media has no file; the audio step refuses it.
        const auto media = track ? track->GetMedia() : nullptr;
        if (!media || media->GetType() != OrloReader::kMediaTypeAudio) continue;
        NewMob<IAAFSourceMob> fileMob(defs.cdSourceMob());
        const auto instance = static_cast<aafUInt8>(kFileMobInstance + fileMobs.size());
        fileMob.mob->SetMobID(WithInstanceHigh(movie.GetMobID(), instance));
        fileMob.mob->SetName(name.c_str());
        fileMobs.emplace_back(fileMob.mob, fileMob.specific);
    }
    return fileMobs;
}

TOVRESULT Build(Movie& movie, const ZEBString& path, IAAFFile** out) {
    TransientClip clip(movie, path);
    IAAFDictionary* dictionary = clip.Dictionary();
    GroupFileMobs fileMobs = MakeFileMobs(movie, clip.Defs());

    const aafRational_t movieRate = movie.GetMovieEditRate();
    const aafRational_t tapeRate = movie.GetTapeMobEditRate().GetRationalFramerate();
    auto timecodeCount = static_cast<unsigned int>(AddTimecodeSlots(movie, tapeRate, dictionary, clip.Tape().mob));
    unsigned int audioCount = 0;
    const long long startOffset = StartOffset(movie, movieRate, tapeRate);
    GroupDescriptors descriptors;
    TOVCheck(AddAudioTracksFromGroupingToAAF(&movie, movie.GetStartingTrackIndex(), timecodeCount, audioCount,
                                             movieRate, startOffset, movie.GetMovieGroupLength(), dictionary,
                                             clip.Master().mob, clip.Master().specific, fileMobs, clip.Tape().mob,
                                             clip.Tape().specific, descriptors));

    std::vector<IAAFMob*> mobs;
    for (const auto& fileMob : fileMobs) mobs.push_back(std::get<0>(fileMob));
    clip.Complete(movie, mobs, out);
    return TOV_OK;
}

}  // namespace

TOVRESULT AAFFromMovieWithGrouping(OrloReader::Movie* movie, const ZEBString& path, IAAFFile** out,
                                   ITOVComponentFactory*) {
    return TOVGuarded([&] {
        if (out == nullptr || movie == nullptr || path.IsEmpty()) return TOV_E_INVALIDARG;
        return Build(*movie, path, out);
    });
}

}  // namespace Impl
}  // namespace ZEB
