#include "clipmodel/AddTimeCodeFromMetadata.h"

#include <memory>
#include <string>

#include "boundary/ModuleGlobals.h"
#include "boundary/OrloConstants.h"
#include "clipmodel/FindBextKeyword.h"
#include "clipmodel/FrameRateTable.h"
#include "clipmodel/GetFileCreationTime.h"
#include "clipmodel/IsToggleOn.h"
#include "clipmodel/TextForms.h"
#include "clipmodel/Timecode.h"
#include "clipmodel/TruncateToInteger.h"
#include "reader/ParseOriginationTime.h"
#include "tov/TOVResult.h"

namespace OrloReader {

namespace {

// The rate found from a `bext` Description keyword, if its value names one.
bool RateFromKeyword(const Chunks::BEXT::BEXTChunk& bext, const char* key, _aafRational_t& rate, bool& drop) {
    std::string value;
    return FindBextKeyword(&bext, key, value) && HelperFunctions::StringToFrameRate(value, rate, drop);
}

TimeCodeInfo StartFromSamples(unsigned long long samples, double sampleRate, double fps, int fpsInt, bool drop) {
    const Timecode::timecode_t tc =
        Timecode::SamplesToTC(static_cast<long long>(samples), sampleRate, fps, fpsInt, drop, fpsInt, drop);
    TimeCodeInfo start;
    TimeCodeToTimeCodeInfo(tc, start);
    return start;
}

double FramesPerSecond(const _aafRational_t& rate) {
    return rate.denominator != 0 ? static_cast<double>(rate.numerator) / rate.denominator : 0.0;
}

}  // namespace

bool ChooseFrameRateFromFileAttributes(const Chunks::IXML::IXMLSpeed* speed, const Chunks::BEXT::BEXTChunk* bext,
                                       bool useDropFlag, _aafRational_t& rate, bool& drop, const char** source) {
    if (speed != nullptr && speed->HasTimeCodeRate()) {
        rate = speed->GetTimeCodeRate();
        drop = useDropFlag && speed->HasTimeCodeFlag() && speed->GetTimeCodeFlag() &&
               Timecode::TCFPSCanBeDF(HelperFunctions::TruncateToInt32(FramesPerSecond(rate) + 0.5));
        if (source != nullptr) *source = "iXML";
        return true;
    }
    if (bext == nullptr) return false;
    if (RateFromKeyword(*bext, "FRAMERATE", rate, drop)) {
        if (source != nullptr) *source = "BEXT FRAMERATE keyword";
        return true;
    }
    if (RateFromKeyword(*bext, "SPEED", rate, drop)) {
        if (source != nullptr) *source = "BEXT SPEED keyword";
        return true;
    }
    return false;
}

void AddTimeCodeFromMetadata(const Chunks::BEXT::BEXTChunk* bext, bool hasBext, const Chunks::IXML::IXMLData& ixml,
                             bool hasIxml, double sampleRate, long long, ZEB::ZEBString path, Movie& movie,
                             ITOVComponentFactory*) {
    movie.SetMovieEditRate(_aafRational_t{static_cast<aafInt32>(sampleRate), 1});
    movie.SetHasMovieEditRate(true);

    double workingRate = sampleRate;
    unsigned long long startSamples = 0;
    bool useSamples = false;
    const char* startSource = nullptr;
    const char* rateSource = "ZEB settings";

    const bool haveSpeed = hasIxml && ixml.HasSpeed();
    Chunks::IXML::IXMLSpeed speed;
    if (haveSpeed) {
        speed = ixml.GetSpeed();
        if (speed.HasTimeStampSampleRate() && speed.GetTimeStampSampleRate() != 0)
            workingRate = speed.GetTimeStampSampleRate();
    }
    const bool hasBextChunk = hasBext && bext != nullptr;
    if (haveSpeed && speed.HasSamplesSinceMidnight()) {
        startSamples = speed.GetSamplesSinceMidnight();
        startSource = "from iXML samples since midnight";
        useSamples = true;
    } else if (hasBextChunk) {
        startSamples = bext->GetTimeReference();
        useSamples = true;
        startSource = "from BEXT samples since midnight";
        // Some recorders leave the time reference at 0 and give the start only
        // as the origination time; the toggle lets that time count.
        if (startSamples == 0 && IsToggleOn(toggle_StartTimeCodeFromBEXTOriginationDate)) {
            useSamples = false;
            startSource = "of zero";
        }
    }

    if (hasBextChunk && hasIxml && speed.HasTimeStampSampleRate() && bext->GetTimeReference() != 0 &&
        bext->GetTimeReference() != speed.GetSamplesSinceMidnight()) {
        if (g_pConsole == nullptr) throw static_cast<int>(TOV_E_POINTER);
        g_pConsole->PrintNarrow(kTOVDebugLevelWarning,
                                "Note: iXML time reference and BEXT time reference do not match.\n");
    }

    if (!useSamples) {
        short hours = 0, minutes = 0, seconds = 0;
        if (hasBextChunk && Chunks::BEXT::ParseOriginationTime(bext->GetOriginationTime(), hours, minutes, seconds)) {
            startSource = "from BEXT Origination Time";
        } else if (IsToggleOn(toggle_StartTimeCodeFromFileCreationTime)) {
            _aafTimeStamp_t created{};
            GetFileCreationTime(path, &created);
            hours = created.time.hour;
            minutes = created.time.minute;
            seconds = created.time.second;
            startSource = "from file creation time";
        } else {
            hours = minutes = seconds = 0;
            startSource = "set to zero as default";
        }
        TimeToSamples(hours, minutes, seconds, workingRate, startSamples);
    }

    _aafRational_t rate{25, 1};
    bool drop = false;
    if (!ChooseFrameRateFromFileAttributes(haveSpeed ? &speed : nullptr, hasBextChunk ? bext : nullptr,
                                           hasIxml && ixml.HasTape(), rate, drop, &rateSource)) {
        rate = _aafRational_t{25, 1};
        drop = false;
        rateSource = "(No Source)";
    }
    const double fps = FramesPerSecond(rate);
    const int fpsInt = HelperFunctions::TruncateToInt32(fps + 0.5);

    FrameRateSettings frameRate;
    frameRate.SetRationalFramerate(rate, drop);
    movie.SetFileFrameRate(frameRate);
    movie.SetTapeMobEditRate(frameRate);
    movie.SetHasFileFrameRate(true);
    movie.SetHasTapeMobRate(true);

    if (useSamples) {
        movie.SetMovieStartOffset(static_cast<int64_t>(startSamples));
        movie.SetHasMovieStartOffset(true);
    }

    const TimeCodeInfo start = StartFromSamples(startSamples, workingRate, fps, fpsInt, drop);
    auto timecodeTrack = std::make_shared<Track>(kMediaTypeTimecode);
    timecodeTrack->GetMedia()->SetStartTimeCode(start);
    movie.AddTrack(timecodeTrack);
    movie.SetMovieTimeCode(start);
    movie.SetHasMovieTimeCode(true);

    // The file's own timecode is the same start, kept only for a file on tape.
    if (hasIxml && ixml.HasTape()) {
        movie.SetMovieFileTimeCode(start);
        movie.SetHasMovieFileTimeCode(true);
    }

    if (g_pConsole != nullptr)
        g_pConsole->PrintNarrow(kTOVDebugLevelWarning,
                                "File frame rate of %5.2f%s obtained from %s applied to a start time %s\n", fps,
                                drop ? "DF" : "", rateSource, startSource);
}

}  // namespace OrloReader
