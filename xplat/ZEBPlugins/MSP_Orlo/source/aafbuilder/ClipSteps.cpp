#include "aafbuilder/ClipSteps.h"

#include <cmath>

#include "aaf/AAFDescriptorExtensions.h"
#include "aafbuilder/AddLocator.h"
#include "aafbuilder/AddTimecode.h"
#include "aafbuilder/WideThroughString.h"
#include "boundary/OrloRegInfo.h"
#include "clipmodel/TruncateToInteger.h"
#include "time/GetMaxDuration.h"
#include "tov/sdk/TOVFailureStyle.h"

namespace ZEB {
namespace Impl {

aafMobID_t WithInstanceHigh(aafMobID_t id, aafUInt8 value) {
    id.instanceHigh = value;
    return id;
}

void SetMobName(IAAFMob* mob, const std::string& utf8) { TOVCheck(mob->SetName(WideThroughString(utf8).c_str())); }

int AddTimecodeSlots(const OrloReader::Movie& movie, const aafRational_t& tapeRate, IAAFDictionary* dictionary,
                     IAAFMob* tape) {
    int timecodeCount = 0;
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
    return timecodeCount;
}

// Worked out in single precision on purpose: the host's clips have always
// been placed so, and long timecodes land up to several hundred units from
// the exact value.
long long StartOffset(const OrloReader::Movie& movie, const aafRational_t& movieRate, const aafRational_t& tapeRate) {
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

void AddDescriptorLocation(const ZEBString& path, IAAFDictionary* dictionary, IAAFEssenceDescriptor* descriptor) {
    TOVCheck(AddLocator(path, dictionary, descriptor));
    TOVCheck(AAFUtils::SetMediaContainerGUID(dictionary, descriptor, OrloRegInfo::CompID_OrloReaderMovContainer));
}

IAAFSmartPointer<IAAFMobSlot> LookupSlot(IAAFMob* mob, aafSlotID_t id) {
    IAAFSmartPointer<IAAFMobSlot> slot;
    TOVCheck(IAAFSmartPointer<IAAFMob>(mob)->LookupSlot(id, &slot));
    return slot;
}

// 48 hours of edit units, rounded up.
aafLength_t TapeLength(aafLength_t length, const aafRational_t& editRate) {
    const double padding = std::ceil(editRate.numerator * 172800.0 / editRate.denominator);
    return length < padding ? HelperFunctions::TruncateToInt64(static_cast<double>(length) + padding) : length;
}

}  // namespace Impl
}  // namespace ZEB
