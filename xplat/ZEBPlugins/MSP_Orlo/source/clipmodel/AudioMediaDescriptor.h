#pragma once
/// What one audio track's samples look like in its file.
#include <cstdint>

#include "clipmodel/MediaType.h"

namespace OrloReader {

class AudioMediaDescriptor {
public:
    /// The program's literal defaults; the intake always passes every value.
    AudioMediaDescriptor() = default;
    AudioMediaDescriptor(AudioFormat format, double sampleRate, uint32_t bytesPerFrame, uint32_t bytesPerPacket,
                         uint32_t channelsPerFrame, uint32_t bitsPerChannel, bool bigEndian, bool floatingPoint,
                         uint64_t startOffset);

    AudioFormat GetFormat() const { return m_Format; }
    /// Hz.
    double GetSampleRate() const { return m_SampleRate; }
    /// One sample of every channel of the file.
    uint32_t GetBytesPerFrame() const { return m_BytesPerFrame; }
    uint32_t GetBytesPerPacket() const { return m_BytesPerPacket; }
    /// Channels in the file, not in this track.
    uint32_t GetChannelsPerFrame() const { return m_ChannelsPerFrame; }
    uint32_t GetBitsPerChannel() const { return m_BitsPerChannel; }
    bool IsBigEndian() const { return m_BigEndian; }
    bool IsFloatingPoint() const { return m_FloatingPoint; }
    /// File offset of this track's first sample.
    uint64_t GetStartOffset() const { return m_StartOffset; }

private:
    AudioFormat m_Format = kAudioFormatPCM;
    double m_SampleRate = 24.0;
    uint32_t m_BytesPerFrame = 18;
    uint32_t m_BytesPerPacket = 36;
    uint32_t m_ChannelsPerFrame = 2;
    uint32_t m_BitsPerChannel = 48;
    bool m_BigEndian = false;
    bool m_FloatingPoint = false;
    uint64_t m_StartOffset = 0;
};

}  // namespace OrloReader
