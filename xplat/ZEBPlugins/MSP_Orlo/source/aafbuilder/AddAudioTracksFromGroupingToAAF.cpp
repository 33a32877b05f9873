#include "aafbuilder/AddAudioTracksFromGroupingToAAF.h"

#include <cwchar>

#include "aaf/AAFDescriptorExtensions.h"
#include "aafbuilder/AddAudioDescriptor.h"
#include "aafbuilder/ClipSteps.h"
#include "tov/sdk/TOVFailureStyle.h"

namespace ZEB {
namespace Impl {

namespace {

// Names and numbers a slot just made and puts its Source Clip into a Sequence.
void FinishSlot(IAAFMob* mob, aafSlotID_t id, aafUInt32 physical, const wchar_t* name, IAAFDictionary* dictionary) {
    const auto slot = LookupSlot(mob, id);
    TOVCheck(slot->SetPhysicalNum(physical));
    TOVCheck(slot->SetName(name));
    TOVCheck(AAFUtils::InsertSequenceToTimelineMobSlot(dictionary, slot));
}

// The member's own descriptor: its format, the host's access, and its file.
IAAFSmartPointer<IAAFEssenceDescriptor> DescribeMember(IAAFPCMDescriptor* pcm, const OrloReader::Track& track,
                                                       IAAFDictionary* dictionary, IAAFSourceMob* file) {
    IAAFSmartPointer<IAAFEssenceDescriptor> essence;
    TOVCheck(pcm->QueryInterface(IID_IAAFEssenceDescriptor, reinterpret_cast<void**>(&essence)));
    IAAFSmartPointer<IAAFFileDescriptor> fileDescriptor;
    TOVCheck(essence->QueryInterface(IID_IAAFFileDescriptor, reinterpret_cast<void**>(&fileDescriptor)));
    TOVCheck(AAFUtils::SetMediaAccessKind(dictionary, fileDescriptor, kMediaAccessKind));
    AddDescriptorLocation(track.GetPathToSource(), dictionary, essence);
    TOVCheck(file->SetEssenceDescriptor(essence));
    return essence;
}

}  // namespace

TOVRESULT AddAudioTracksFromGroupingToAAF(OrloReader::Movie* movie, int, unsigned int& timecodeCount,
                                          unsigned int& audioCount, const _aafRational_t& editRate,
                                          long long startOffset, long long groupLength, IAAFDictionary* dictionary,
                                          IAAFMob* masterMob, IAAFMasterMob* master, GroupFileMobs& fileMobs,
                                          IAAFMob* tapeMob, IAAFSourceMob* tape, GroupDescriptors& descriptors) {
    return TOVGuarded([&] {
        const aafSlotID_t base = timecodeCount + audioCount;
        aafMobID_t tapeID;
        TOVCheck(IAAFSmartPointer<IAAFMob>(tapeMob)->GetMobID(&tapeID));
        IAAFSmartPointer<IAAFDictionary> dictionaryRef(dictionary);
        IAAFSmartPointer<IAAFDataDef> sound;
        TOVCheck(dictionaryRef->LookupDataDef(kAAFDataDef_LegacySound, &sound));
        IAAFSmartPointer<IAAFMasterMob> masterSource(master);
        IAAFSmartPointer<IAAFSourceMob> tapeSource(tape);

        aafUInt32 done = 0;  // the highest channel that has its tape slots
        size_t file = 0;     // the file Mob of the next member that gets slots
        for (unsigned int t = 0; t < movie->GetTrackCount(); ++t) {
            const auto track = movie->GetTrack(t);
            // A null track counts as a track without media.
            const auto media = track ? track->GetMedia() : nullptr;
            if (!media) throw static_cast<int>(TOV_E_UNEXPECTED);
            if (media->GetType() != OrloReader::kMediaTypeAudio) continue;

            IAAFSmartPointer<IAAFPCMDescriptor> pcm;
            TOVCheck(dictionaryRef->CreateInstance(AUID_AAFPCMDescriptor, IID_IAAFPCMDescriptor,
                                                   reinterpret_cast<IUnknown**>(&pcm)));
            TOVCheck(pcm->Initialize());
            // A descriptor that stops half way does not stop the clip.
            AddAudioDescriptor(pcm, media);
            const auto& [fileMob, fileSource] = fileMobs.at(file);
            aafMobID_t fileID;
            TOVCheck(fileMob->GetMobID(&fileID));

            const aafUInt32 channel = track->GetChannelIndex();
            while (done < channel) {
                const aafUInt32 n = done++;
                wchar_t name[32];
                std::swprintf(name, 32, L"A%d", static_cast<int>(done));
                const aafSlotID_t tapeSlot = base + n + 1;
                // The file's own step; with one timecode slot before the
                // audio that is the last of the run up to its channel. With
                // none, no file would get its slots.
                if (static_cast<long long>(n) == static_cast<long long>(channel) - base) {
                    const aafSlotID_t masterSlot = base + 1 + static_cast<aafSlotID_t>(file);
                    TOVCheck(masterSource->NewPhysSourceRef(editRate, masterSlot, sound,
                                                            aafSourceRef_t{fileID, base + 1, 0}, groupLength));
                    FinishSlot(masterMob, masterSlot, channel, name, dictionary);
                    TOVCheck(fileSource->NewPhysSourceRef(editRate, base + 1, sound,
                                                          aafSourceRef_t{tapeID, tapeSlot, startOffset}, groupLength));
                    FinishSlot(fileMob, base + 1, channel, name, dictionary);
                    descriptors.emplace_back(DescribeMember(pcm, *track, dictionary, fileSource), pcm);
                    ++file;
                }
                TOVCheck(tapeSource->AddNilReference(tapeSlot, TapeLength(groupLength, editRate), sound, editRate));
                FinishSlot(tapeMob, tapeSlot, channel, name, dictionary);
            }
        }
        return TOV_OK;
    });
}

}  // namespace Impl
}  // namespace ZEB
