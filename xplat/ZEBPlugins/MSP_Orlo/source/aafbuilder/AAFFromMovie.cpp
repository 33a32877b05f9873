#include "aafbuilder/AAFFromMovie.h"

#include "aaf/AAFDescriptorExtensions.h"
#include "aafbuilder/AddAudioTracksToAAF.h"
#include "aafbuilder/ClipSteps.h"
#include "aafbuilder/NewMob.h"
#include "aafbuilder/TransientClip.h"
#include "tov/sdk/TOVFailureStyle.h"

namespace ZEB {
namespace Impl {

namespace {

using OrloReader::Movie;

TOVRESULT Build(Movie& movie, const ZEBString& path, IAAFFile** out) {
    TransientClip clip(movie, path);
    IAAFDictionary* dictionary = clip.Dictionary();
    NewMob<IAAFSourceMob> fileMob(clip.Defs().cdSourceMob());
    TOVCheck(fileMob.mob->SetMobID(WithInstanceHigh(movie.GetMobID(), kFileMobInstance)));
    SetMobName(fileMob.mob, movie.GetMovieTapeID());

    IAAFSmartPointer<IAAFPCMDescriptor> pcm;
    TOVCheck(
        dictionary->CreateInstance(AUID_AAFPCMDescriptor, IID_IAAFPCMDescriptor, reinterpret_cast<IUnknown**>(&pcm)));
    TOVCheck(pcm->Initialize());
    IAAFSmartPointer<IAAFFileDescriptor> fileDescriptor;
    TOVCheck(pcm->QueryInterface(IID_IAAFFileDescriptor, reinterpret_cast<void**>(&fileDescriptor)));

    const aafRational_t movieRate = movie.GetMovieEditRate();
    const aafRational_t tapeRate = movie.GetTapeMobEditRate().GetRationalFramerate();
    int timecodeCount = AddTimecodeSlots(movie, tapeRate, dictionary, clip.Tape().mob);
    int audioCount = 0;
    const long long startOffset = StartOffset(movie, movieRate, tapeRate);
    TOVCheck(AddAudioTracksToAAF(&movie, movie.GetStartingTrackIndex(), timecodeCount, audioCount, movieRate,
                                 startOffset, dictionary, clip.Master().mob, clip.Master().specific, fileMob.mob,
                                 fileMob.specific, clip.Tape().mob, clip.Tape().specific, pcm));

    IAAFSmartPointer<IAAFEssenceDescriptor> pcmEssence;
    TOVCheck(pcm->QueryInterface(IID_IAAFEssenceDescriptor, reinterpret_cast<void**>(&pcmEssence)));
    AddDescriptorLocation(clip.Path(), dictionary, pcmEssence);
    TOVCheck(AAFUtils::SetMediaAccessKind(dictionary, fileDescriptor, kMediaAccessKind));
    TOVCheck(fileMob.specific->SetEssenceDescriptor(pcmEssence));

    clip.Complete(movie, {fileMob.mob}, out);
    return TOV_OK;
}

}  // namespace

TOVRESULT AAFFromMovie(OrloReader::Movie* movie, const ZEBString& path, IAAFFile** out, ITOVComponentFactory*) {
    return TOVGuarded([&] {
        if (out == nullptr || movie == nullptr || path.IsEmpty()) return TOV_E_INVALIDARG;
        return Build(*movie, path, out);
    });
}

}  // namespace Impl
}  // namespace ZEB
