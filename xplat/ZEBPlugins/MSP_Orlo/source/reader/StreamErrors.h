#pragma once
/// Error texts that more than one place of the reader throws. The stream keeps
/// a thrown text as its error, so each must be static text.

namespace Orlo {

inline constexpr char kUnsupportedBitsError[] = "Only 16, 24, and 32-bit audio files are supported";
/// A file that says it has no channels has no frame to count samples by.
inline constexpr char kNoChannelsError[] = "Audio files without channels are not supported";

}  // namespace Orlo
