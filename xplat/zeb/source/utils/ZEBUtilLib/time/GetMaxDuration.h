#pragma once
/// The longest clip, 120 hours, in frames.
namespace ZEB {

/// The drop-frame figure, whatever the rate: ((fps * 60 - d) * 10 + d) * 720
/// with d the frames dropped per minute (0 at rates that drop none).
unsigned int GetMaxDuration(unsigned int fps);
/// fps * 432000 without drop; the drop-frame figure with it.
unsigned int GetMaxDuration(unsigned int fps, bool drop);

}  // namespace ZEB
