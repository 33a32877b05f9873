#pragma once
/// What a track carries, and the one audio format the intake writes.

namespace OrloReader {

enum MediaType { kMediaTypeAudio = 0, kMediaTypeTimecode = 1 };

enum AudioFormat { kAudioFormatPCM = 0 };

}  // namespace OrloReader
