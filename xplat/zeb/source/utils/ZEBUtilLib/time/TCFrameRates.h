#pragma once
/// What a timecode rate implies for drop-frame counting and high rates.
namespace ZEB {

/// Frame labels that drop-frame counting skips each minute: 2 at 30, 4 at 60,
/// 8 at 120, 0 at every other rate.
unsigned int TCGetNumFramesDroppedPerMinute(unsigned int fps);
/// True at 50 and 60 only; 120 does not count as high here.
bool TCFPSIsHighFPS(unsigned int fps);
/// 30 for 60, 25 for 50, otherwise `fps` itself.
unsigned int TCGetCorrespondingLowFPS(unsigned int fps);

}  // namespace ZEB
