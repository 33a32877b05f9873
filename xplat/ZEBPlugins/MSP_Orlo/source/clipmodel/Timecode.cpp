#include "clipmodel/Timecode.h"

#include "clipmodel/TruncateToInteger.h"

namespace Timecode {

namespace {

/// Frames in each displayed unit under one description. Kept in 64 bits so
/// that a day at a large nominal rate cannot overflow.
struct FrameUnits {
    int64_t fps;
    int64_t dropped;
    int64_t minute;
    int64_t tenMinutes;
    int64_t hour;
    int64_t day;
};

const timecodeDesc_t& Effective(const timecodeDesc_t& desc) { return desc.fps == 0 ? TCdefaultDesc : desc; }

FrameUnits UnitsOf(const timecodeDesc_t& given) {
    const timecodeDesc_t& desc = Effective(given);
    FrameUnits units{};
    units.fps = desc.fps;
    units.dropped = (desc.flags & TCDropFrameFlag) ? TCGetNumFramesDroppedPerMinute(desc.fps) : 0;
    units.minute = units.fps * 60 - units.dropped;
    // Every tenth minute keeps its dropped frames.
    units.tenMinutes = units.minute * 10 + units.dropped;
    units.hour = units.tenMinutes * 6;
    units.day = units.tenMinutes * 144;
    return units;
}

void SetDropBit(timecodeDesc_t& desc, bool drop) {
    if (drop) {
        desc.flags |= TCDropFrameFlag;
    } else {
        desc.flags &= ~TCDropFrameFlag;
    }
}

void ClearDropUnlessAllowed(timecodeDesc_t& desc) {
    if (!TCFPSCanBeDF(desc.fps)) SetDropBit(desc, false);
}

}  // namespace

bool TCFPSCanBeDF(int fps) { return fps == 30 || fps == 60; }

bool TCCanBeDF(timecode_t tc) { return TCFPSCanBeDF(tc.desc.fps); }

bool TCFPSIsHighFPS(int fps) { return fps == 48 || fps == 50 || fps == 60; }

bool TCIsHighFPS(timecode_t tc) { return TCFPSIsHighFPS(tc.desc.fps); }

int TCGetNumFramesDroppedPerMinute(unsigned short fps) {
    if (fps == 30) return 2;
    if (fps == 60) return 4;
    return 0;
}

timecodeDesc_t TCCreateDesc(unsigned char drop, unsigned short fps) {
    timecodeDesc_t desc{0, fps, 0, 0};
    SetDropBit(desc, drop != 0 && TCFPSCanBeDF(fps));
    return desc;
}

timecode_t TCCreateDur(int frames, const timecodeDesc_t* desc) {
    return timecode_t{desc ? Effective(*desc) : TCdefaultDesc, frames};
}

timecode_t SamplesToTC(long long samples, double sampleRate, double fps, int fpsIn, unsigned char dropIn, int fpsOut,
                       unsigned char dropOut) {
    // One sample more than the position: a frame boundary at sample 0 already
    // counts as passed.
    const int32_t frames = HelperFunctions::TruncateToInt32((static_cast<double>(samples) + 1.0) * fps / sampleRate);
    const timecodeDesc_t desc = fpsIn == 0 ? TCdefaultDesc : TCCreateDesc(dropIn, static_cast<unsigned short>(fpsIn));
    timecode_t tc{desc, frames};
    TCConvertFPS(&tc, static_cast<unsigned short>(fpsOut));
    TCChangeDrop(&tc, dropOut);
    return tc;
}

void TCConvertFPS(timecode_t* tc, unsigned short fps) {
    const unsigned short oldFps = tc->desc.fps;
    if (oldFps == fps) return;
    if (tc->count == 0 || tc->count == TCNoValue) {
        // A description of no rate keeps having none; only its drop bit goes.
        if (oldFps == 0) {
            SetDropBit(tc->desc, false);
        } else {
            tc->desc.fps = fps;
            ClearDropUnlessAllowed(tc->desc);
        }
        return;
    }
    short days = 0, hours = 0, minutes = 0, seconds = 0, frames = 0;
    TCDeconstruct(*tc, &days, &hours, &minutes, &seconds, &frames);
    // Single precision as the rate conversion always had it. From a rate of 0
    // the ratio is not finite, its truncation is the no-value marker, and the
    // cut to 16 bits leaves 0 frames.
    const float scaled = static_cast<float>(frames) * static_cast<float>(fps) / static_cast<float>(oldFps);
    const short newFrames = static_cast<short>(HelperFunctions::TruncateToInt32(static_cast<double>(scaled) + 0.5));
    tc->desc.fps = fps;
    ClearDropUnlessAllowed(tc->desc);
    tc->count = TCConstruct(days, hours, minutes, seconds, newFrames, &tc->desc).count;
}

void TCChangeDrop(timecode_t* tc, unsigned char drop) {
    const bool wanted = drop != 0;
    if (wanted == ((tc->desc.flags & TCDropFrameFlag) != 0)) return;
    if (wanted && !TCCanBeDF(*tc)) return;
    if (tc->count == TCNoValue) {
        SetDropBit(tc->desc, wanted);
        return;
    }
    short days = 0, hours = 0, minutes = 0, seconds = 0, frames = 0;
    TCDeconstruct(*tc, &days, &hours, &minutes, &seconds, &frames);
    SetDropBit(tc->desc, wanted);
    tc->count = TCConstruct(days, hours, minutes, seconds, frames, &tc->desc).count;
}

long long TCToSamples(timecode_t tc, double sampleRate, double fps) {
    return HelperFunctions::TruncateToInt64(static_cast<double>(tc.count) * sampleRate / fps + 0.5);
}

void TCDeconstruct(timecode_t tc, short* days, short* hours, short* minutes, short* seconds, short* frames) {
    const FrameUnits units = UnitsOf(tc.desc);
    const int64_t count = tc.count;
    const int64_t dayCount = count / units.day;
    const int64_t rest = count - dayCount * units.day;
    const int64_t hourCount = rest / units.hour;
    const int64_t rest2 = rest - hourCount * units.hour;
    const int64_t tens = rest2 / units.tenMinutes;
    const int64_t rest3 = rest2 - tens * units.tenMinutes;
    // The dropped frames are taken only to find the minute: the first minute
    // of each ten keeps all of its frames.
    const int64_t minuteUnits = (rest3 - units.dropped) / units.minute;
    const int64_t inMinute = rest3 - units.minute * minuteUnits;
    if (days) *days = static_cast<short>(dayCount);
    if (hours) *hours = static_cast<short>(hourCount);
    if (minutes) *minutes = static_cast<short>(minuteUnits + tens * 10);
    if (seconds) *seconds = static_cast<short>(inMinute / units.fps);
    if (frames) *frames = static_cast<short>(inMinute % units.fps);
}

timecode_t TCConstruct(short days, short hours, short minutes, short seconds, short frames,
                       const timecodeDesc_t* desc) {
    timecode_t tc = TCCreateDur(0, desc);
    ClearDropUnlessAllowed(tc.desc);
    const FrameUnits units = UnitsOf(tc.desc);
    const int64_t tens = minutes / 10;
    const int64_t minuteUnits = minutes - tens * 10;
    const int64_t count = days * units.day + hours * units.hour + tens * units.tenMinutes + minuteUnits * units.minute +
                          seconds * units.fps + frames;
    // A count beyond 32 bits keeps its low 32 bits.
    tc.count = static_cast<int32_t>(count);
    return tc;
}

}  // namespace Timecode
