#pragma once
/// Timecodes as frame counts under a description of frames per second and
/// drop-frame counting: conversion from samples, between rates and between
/// drop and non-drop, and the split into displayed fields.
#include <cstdint>

namespace Timecode {

/// How a frame count is read.
struct timecodeDesc_t {
    /// Bit 0 set: drop frame.
    uint32_t flags;
    /// Nominal integer frames per second.
    uint16_t fps;
    /// Copied, no other use.
    uint16_t reserved;
    /// Copied, no other use.
    uint32_t extra;
};

/// A frame count under a description; the count `TCNoValue` means no value.
struct timecode_t {
    timecodeDesc_t desc;
    int32_t count;
};

/// The marker count for no value, 0x80000000.
inline constexpr int32_t TCNoValue = INT32_MIN;

/// Bit 0 of `timecodeDesc_t::flags`.
inline constexpr uint32_t TCDropFrameFlag = 1;

/// Stands in for any description with fps 0: 30 fps non-drop.
inline constexpr timecodeDesc_t TCdefaultDesc = {0, 30, 0, 0};

/// True for 30 and 60, the rates with a drop-frame count.
bool TCFPSCanBeDF(int fps);
bool TCCanBeDF(timecode_t tc);
/// True for 48, 50 and 60, whose frames are shown as pairs.
bool TCFPSIsHighFPS(int fps);
bool TCIsHighFPS(timecode_t tc);
/// 2 for 30, 4 for 60, else 0.
int TCGetNumFramesDroppedPerMinute(unsigned short fps);

/// A description whose drop bit is set only when `drop` is true and the rate
/// can be drop frame.
timecodeDesc_t TCCreateDesc(unsigned char drop, unsigned short fps);
/// A timecode of `frames` under `desc`, or under `TCdefaultDesc` when `desc`
/// is null or has fps 0.
timecode_t TCCreateDur(int frames, const timecodeDesc_t* desc);

/// The timecode of a sample position: the frame reached after samples + 1
/// samples at `fps`, read at `fpsIn` and `dropIn`, then converted to `fpsOut`
/// and `dropOut`.
timecode_t SamplesToTC(long long samples, double sampleRate, double fps, int fpsIn, unsigned char dropIn, int fpsOut,
                       unsigned char dropOut);
/// Changes the rate, keeping the displayed fields with the frames scaled.
void TCConvertFPS(timecode_t* tc, unsigned short fps);
/// Sets or clears drop frame, keeping the displayed fields; the count changes.
void TCChangeDrop(timecode_t* tc, unsigned char drop);
/// count x sampleRate / fps, rounded half up.
long long TCToSamples(timecode_t tc, double sampleRate, double fps);

/// The displayed fields of a timecode. Any pointer may be null.
void TCDeconstruct(timecode_t tc, short* days, short* hours, short* minutes, short* seconds, short* frames);
/// The timecode of displayed fields under `desc` (null or fps 0: the default),
/// with the drop bit cleared unless the rate can be drop frame.
timecode_t TCConstruct(short days, short hours, short minutes, short seconds, short frames, const timecodeDesc_t* desc);

}  // namespace Timecode
