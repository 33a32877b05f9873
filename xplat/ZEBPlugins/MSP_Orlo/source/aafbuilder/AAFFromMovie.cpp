#include "aafbuilder/AAFFromMovie.h"

#include "aaf/AAFDescriptorExtensions.h"
#include "aafbuilder/AddAudioTracksToAAF.h"
#include "aafbuilder/AddLocator.h"
#include "aafbuilder/AddMovieMetaData.h"
#include "aafbuilder/AddTimecode.h"
#include "aafbuilder/CAAFBuiltinDefs.h"
#include "aafbuilder/WideThroughString.h"
#include "boundary/OrloRegInfo.h"
#include "clipmodel/TruncateToInteger.h"
#include "identity/GetProductID.h"
#include "time/GetMaxDuration.h"
#include "tov/sdk/TOVFailureStyle.h"

namespace ZEB {
namespace Impl {

namespace {

using OrloReader::Movie;

// The Master Mob has the Movie's identity; the Source Mobs differ from it in
// byte 13, the instance number's high byte.
constexpr aafUInt8 kFileMobInstance = 0xB1;
constexpr aafUInt8 kTapeMobInstance = 0xA1;

aafMobID_t WithInstanceHigh(aafMobID_t id, aafUInt8 value) {
    id.instanceHigh = value;
    return id;
}

// One Mob as both of its interfaces, made usable.
template <class Specific>
struct NewMob {
    IAAFSmartPointer<IAAFMob> mob;
    IAAFSmartPointer<Specific> specific;

    explicit NewMob(IAAFClassDef* cls) {
        TOVCheck(cls->CreateInstance(IID_IAAFMob, reinterpret_cast<IUnknown**>(&mob)));
        TOVCheck(mob->QueryInterface(AAFInterfaceID<Specific>::value, reinterpret_cast<void**>(&specific)));
        TOVCheck(specific->Initialize());
    }
};

void SetName(IAAFMob* mob, const std::string& utf8) { TOVCheck(mob->SetName(WideThroughString(utf8).c_str())); }

// Where the file starts on the tape, in edit units of `movieRate`. Worked out
// in single precision on purpose: the host's clips have always been placed so,
// and long timecodes land up to several hundred units from the exact value.
long long StartOffset(const Movie& movie, const aafRational_t& movieRate, const aafRational_t& tapeRate) {
    if (movie.HasMovieStartOffset()) return movie.GetMovieStartOffset();
    if (!movie.HasMovieTimeCode()) return 0;
    const float frames = static_cast<float>(movie.GetMovieTimeCode().GetTotalFrames());
    // 32-bit products that wrap rather than overflow.
    const auto a = static_cast<aafInt32>(static_cast<aafUInt32>(tapeRate.denominator) *
                                         static_cast<aafUInt32>(movieRate.numerator));
    const auto b = static_cast<aafInt32>(static_cast<aafUInt32>(movieRate.denominator) *
                                         static_cast<aafUInt32>(tapeRate.numerator));
    const float offset = static_cast<float>(a) / static_cast<float>(b) * frames;
    return HelperFunctions::TruncateToInt64(offset);
}

void AddTimecodeSlots(const Movie& movie, const aafRational_t& tapeRate, IAAFDictionary* dictionary, IAAFMob* tape,
                      int& timecodeCount) {
    for (unsigned int i = 0; i < movie.GetTrackCount(); ++i) {
        const auto track = movie.GetTrack(i);
        // A track without media is not timecode; the audio step refuses it.
        const auto media = track ? track->GetMedia() : nullptr;
        if (!media || media->GetType() != OrloReader::kMediaTypeTimecode) continue;
        const auto fps = static_cast<aafUInt16>(
            HelperFunctions::TruncateToInt64(static_cast<double>(tapeRate.numerator) / tapeRate.denominator + 0.5));
        // The tape always starts at 00:00:00:00; the file's place on it is
        // the start offset of the file Mob's reference.
        _aafTimecode_t timecode{0, media->GetStartTimeCode().IsDropFrame() ? 1 : 0, fps};
        const long long length = GetMaxDuration(fps, false);
        const long long none = 0;
        // A slot that could not be made is left out; the clip goes on.
        AddTimecodeAAFTrack(timecode, static_cast<unsigned int>(timecodeCount), timecodeCount, tapeRate, length, none,
                            none, dictionary, tape);
        ++timecodeCount;
    }
}

void AddDescriptorLocation(const ZEBString& path, IAAFDictionary* dictionary, IAAFEssenceDescriptor* descriptor) {
    TOVCheck(AddLocator(path, dictionary, descriptor));
    TOVCheck(AAFUtils::SetMediaContainerGUID(dictionary, descriptor, OrloRegInfo::CompID_OrloReaderMovContainer));
}

// The empty transient file of one clip, named as the plug-in's. A build that
// fails after this leaves the file allocated, by design: the leak checker of
// the builder's tests lets go of what this allocates, and of nothing else.
IAAFFile* OpenTransientClipFile() {
    _aafProductIdentification_t product;
    GetProductID(product, OrloRegInfo::kVersionMajor, OrloRegInfo::kVersionMinor, OrloRegInfo::kVersionPatch,
                 OrloRegInfo::kVersionBuild, OrloRegInfo::kVendorName, OrloRegInfo::kPluginName,
                 OrloRegInfo::kVersionWideText, OrloRegInfo::CompID_OrloReaderMovContainer);
    IAAFFile* file = nullptr;
    TOVCheck(AAFFileOpenTransient(&product, &file));
    return file;
}

TOVRESULT Build(Movie& movie, const ZEBString& path, IAAFFile** out) {
    ZEBString widePath(path);
    widePath.ConvertTo(kTOVUnicodeWCHAR);

    // Held plainly: a failure below neither closes nor releases the file.
    IAAFFile* file = OpenTransientClipFile();
    IAAFSmartPointer<IAAFHeader> header;
    TOVCheck(IAAFSmartPointer<IAAFFile>(file)->GetHeader(&header));
    IAAFSmartPointer<IAAFDictionary> dictionary;
    TOVCheck(header->GetDictionary(&dictionary));
    CAAFBuiltinDefs defs(dictionary);

    NewMob<IAAFMasterMob> master(defs.cdMasterMob());
    NewMob<IAAFSourceMob> fileMob(defs.cdSourceMob());
    NewMob<IAAFSourceMob> tapeMob(defs.cdSourceMob());

    const aafMobID_t& id = movie.GetMobID();
    TOVCheck(master.mob->SetMobID(id));
    TOVCheck(fileMob.mob->SetMobID(WithInstanceHigh(id, kFileMobInstance)));
    TOVCheck(tapeMob.mob->SetMobID(WithInstanceHigh(id, kTapeMobInstance)));

    SetName(master.mob, movie.GetMovieName());
    SetName(fileMob.mob, movie.GetMovieTapeID());
    SetName(tapeMob.mob, movie.IsMovieOnTape() ? movie.GetMovieTapeName() : movie.GetMovieTapeID());

    IAAFSmartPointer<IAAFPCMDescriptor> pcm;
    TOVCheck(
        dictionary->CreateInstance(AUID_AAFPCMDescriptor, IID_IAAFPCMDescriptor, reinterpret_cast<IUnknown**>(&pcm)));
    TOVCheck(pcm->Initialize());
    IAAFSmartPointer<IAAFFileDescriptor> fileDescriptor;
    TOVCheck(pcm->QueryInterface(IID_IAAFFileDescriptor, reinterpret_cast<void**>(&fileDescriptor)));

    const aafRational_t movieRate = movie.GetMovieEditRate();
    const aafRational_t tapeRate = movie.GetTapeMobEditRate().GetRationalFramerate();
    int timecodeCount = 0;
    int audioCount = 0;
    AddTimecodeSlots(movie, tapeRate, dictionary, tapeMob.mob, timecodeCount);
    const long long startOffset = StartOffset(movie, movieRate, tapeRate);
    TOVCheck(AddAudioTracksToAAF(&movie, movie.GetStartingTrackIndex(), timecodeCount, audioCount, movieRate,
                                 startOffset, dictionary, master.mob, master.specific, fileMob.mob, fileMob.specific,
                                 tapeMob.mob, tapeMob.specific, pcm));

    IAAFSmartPointer<IAAFEssenceDescriptor> pcmEssence;
    TOVCheck(pcm->QueryInterface(IID_IAAFEssenceDescriptor, reinterpret_cast<void**>(&pcmEssence)));
    AddDescriptorLocation(widePath, dictionary, pcmEssence);
    // The host reads the samples itself, through the sample map.
    constexpr unsigned int kMediaAccessKind = 3;
    TOVCheck(AAFUtils::SetMediaAccessKind(dictionary, fileDescriptor, kMediaAccessKind));
    TOVCheck(fileMob.specific->SetEssenceDescriptor(pcmEssence));

    IAAFSmartPointer<IAAFEssenceDescriptor> tapeEssence;
    if (movie.IsMovieOnTape()) {
        IAAFSmartPointer<IAAFTapeDescriptor> descriptor;
        TOVCheck(
            defs.cdTapeDescriptor()->CreateInstance(IID_IAAFTapeDescriptor, reinterpret_cast<IUnknown**>(&descriptor)));
        TOVCheck(descriptor->QueryInterface(IID_IAAFEssenceDescriptor, reinterpret_cast<void**>(&tapeEssence)));
    } else {
        IAAFSmartPointer<IAAFImportDescriptor> descriptor;
        TOVCheck(defs.cdImportDescriptor()->CreateInstance(IID_IAAFImportDescriptor,
                                                           reinterpret_cast<IUnknown**>(&descriptor)));
        TOVCheck(descriptor->QueryInterface(IID_IAAFEssenceDescriptor, reinterpret_cast<void**>(&tapeEssence)));
    }
    AddDescriptorLocation(widePath, dictionary, tapeEssence);
    TOVCheck(tapeMob.specific->SetEssenceDescriptor(tapeEssence));

    AddMovieMetaData(master.mob, &movie);

    // The Mobs enter the file only when whole.
    TOVCheck(header->AddMob(master.mob));
    TOVCheck(header->AddMob(fileMob.mob));
    TOVCheck(header->AddMob(tapeMob.mob));
    *out = file;
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
