#include "aafbuilder/AddAudioTracksToAAF.h"

#include <cwchar>
#include <memory>
#include <vector>

#include "aaf/AAFDescriptorExtensions.h"
#include "aafbuilder/AddAudioDescriptor.h"
#include "aafbuilder/ClipSteps.h"
#include "aafbuilder/IAAFSmartPointer.h"
#include "clipmodel/TruncateToInteger.h"
#include "tov/sdk/TOVFailureStyle.h"

namespace ZEB {
namespace Impl {

namespace {

using OrloReader::Media;

// The last audio track's media. A null track counts as a track without
// media, and so does a Movie with no audio track at all.
std::shared_ptr<Media> LastAudioMedia(const OrloReader::Movie& movie, aafUInt32& channels) {
    std::shared_ptr<Media> audio;
    for (unsigned int i = 0; i < movie.GetTrackCount(); ++i) {
        const auto track = movie.GetTrack(i);
        const auto media = track ? track->GetMedia() : nullptr;
        if (!media) throw static_cast<int>(TOV_E_UNEXPECTED);
        if (media->GetType() != OrloReader::kMediaTypeAudio) continue;
        audio = media;
        // Audio without a sound descriptor has no channels.
        const auto sound = media->GetSoundDescriptor();
        channels = sound ? sound->GetChannelsPerFrame() : 0;
    }
    if (!audio) throw static_cast<int>(TOV_E_UNEXPECTED);
    return audio;
}

// The source reference of the slot's Source Clip; empty when the clip does
// not answer IAAFSourceReference2 and `tolerated` says that may be.
IAAFSmartPointer<IAAFSourceReference2> SourceReference(IAAFMobSlot* slot, bool tolerated) {
    IAAFSmartPointer<IAAFSegment> segment;
    TOVCheck(IAAFSmartPointer<IAAFMobSlot>(slot)->GetSegment(&segment));
    IAAFSmartPointer<IAAFSourceClip> clip;
    TOVCheck(segment->QueryInterface(IID_IAAFSourceClip, reinterpret_cast<void**>(&clip)));
    IAAFSmartPointer<IAAFSourceReference2> reference;
    const AAFRESULT queried = clip->QueryInterface(IID_IAAFSourceReference2, reinterpret_cast<void**>(&reference));
    if (!tolerated) TOVCheck(queried);
    return reference;
}

}  // namespace

TOVRESULT AddAudioTracksToAAF(OrloReader::Movie* movie, int startingTrackIndex, int& timecodeCount, int& audioCount,
                              const _aafRational_t& editRate, long long startOffset, IAAFDictionary* dictionary,
                              IAAFMob* masterMob, IAAFMasterMob* master, IAAFMob* fileMob, IAAFSourceMob* file,
                              IAAFMob* tapeMob, IAAFSourceMob* tape, IAAFPCMDescriptor* pcm) {
    return TOVGuarded([&] {
        aafUInt32 channels = 0;
        const std::shared_ptr<Media> media = LastAudioMedia(*movie, channels);
        // A descriptor that stops half way does not stop the clip.
        AddAudioDescriptor(pcm, media);

        const double sampleRate = media->GetSoundDescriptor() ? media->GetSoundDescriptor()->GetSampleRate() : 0.0;
        aafMobID_t fileID, tapeID;
        TOVCheck(IAAFSmartPointer<IAAFMob>(fileMob)->GetMobID(&fileID));
        TOVCheck(IAAFSmartPointer<IAAFMob>(tapeMob)->GetMobID(&tapeID));
        IAAFSmartPointer<IAAFDataDef> sound;
        TOVCheck(IAAFSmartPointer<IAAFDictionary>(dictionary)->LookupDataDef(kAAFDataDef_LegacySound, &sound));

        const long long first = startingTrackIndex == 0 ? 1 : startingTrackIndex;
        const aafLength_t length = static_cast<aafLength_t>(media->GetSampleCount());
        const long long last = first + channels - 1;
        if (last < 1) return TOV_OK;

        const aafRational_t audioRate{HelperFunctions::TruncateToInt32(sampleRate), 1};
        const aafSlotID_t base = static_cast<aafSlotID_t>(timecodeCount + audioCount);
        const aafSlotID_t fileSlot = base + 1;
        IAAFSmartPointer<IAAFMasterMob> masterSource(master);
        IAAFSmartPointer<IAAFSourceMob> fileSource(file), tapeSource(tape);
        aafSlotID_t k = 1;
        for (long long t = 1; t <= last; ++t) {
            const aafUInt32 track = static_cast<aafUInt32>(t);
            wchar_t name[32];
            std::swprintf(name, 32, L"A%d", static_cast<int>(t));

            if (t >= first) {
                TOVCheck(masterSource->NewPhysSourceRef(audioRate, base + k, sound, aafSourceRef_t{fileID, fileSlot, 0},
                                                        length));
                const auto slot = LookupSlot(masterMob, base + k);
                TOVCheck(slot->SetPhysicalNum(track));
                TOVCheck(slot->SetName(name));
                if (!movie->IsMonoAudio()) {
                    const auto reference = SourceReference(slot, true);
                    if (!reference.IsNull()) {
                        TOVCheck(reference->SetSourceID(fileID));
                        TOVCheck(reference->SetSourceMobSlotID(fileSlot));
                        aafUInt32 channel = track;
                        TOVCheck(reference->SetChannelIDs(1, &channel));
                    }
                }
                ++audioCount;
                TOVCheck(AAFUtils::InsertSequenceToTimelineMobSlot(dictionary, slot));
                ++k;
            }

            if (t == first) {
                TOVCheck(fileSource->NewPhysSourceRef(audioRate, fileSlot, sound,
                                                      aafSourceRef_t{tapeID, base + track, startOffset}, length));
                const auto slot = LookupSlot(fileMob, fileSlot);
                TOVCheck(slot->SetPhysicalNum(static_cast<aafUInt32>(first)));
                if (!movie->IsMonoAudio()) {
                    const auto reference = SourceReference(slot, false);
                    TOVCheck(reference->SetSourceID(tapeID));
                    TOVCheck(reference->SetSourceMobSlotID(0));
                    std::vector<aafUInt32> mono(channels);
                    for (aafUInt32 c = 0; c < channels; ++c) mono[c] = base + static_cast<aafUInt32>(first) + c;
                    TOVCheck(reference->SetMonoSourceSlotIDs(channels, mono.data()));
                }
                TOVCheck(AAFUtils::InsertSequenceToTimelineMobSlot(dictionary, slot));
            }

            // Every track number has a tape slot, those below the first too.
            TOVCheck(tapeSource->AddNilReference(base + track, TapeLength(length, editRate), sound, editRate));
            const auto slot = LookupSlot(tapeMob, base + track);
            TOVCheck(slot->SetPhysicalNum(track));
            TOVCheck(slot->SetName(name));
            TOVCheck(AAFUtils::InsertSequenceToTimelineMobSlot(dictionary, slot));
        }
        return TOV_OK;
    });
}

}  // namespace Impl
}  // namespace ZEB
