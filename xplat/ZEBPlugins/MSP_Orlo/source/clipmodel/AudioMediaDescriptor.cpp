#include "clipmodel/AudioMediaDescriptor.h"

namespace OrloReader {

AudioMediaDescriptor::AudioMediaDescriptor(AudioFormat format, double sampleRate, uint32_t bytesPerFrame,
                                           uint32_t bytesPerPacket, uint32_t channelsPerFrame, uint32_t bitsPerChannel,
                                           bool bigEndian, bool floatingPoint, uint64_t startOffset)
    : m_Format(format),
      m_SampleRate(sampleRate),
      m_BytesPerFrame(bytesPerFrame),
      m_BytesPerPacket(bytesPerPacket),
      m_ChannelsPerFrame(channelsPerFrame),
      m_BitsPerChannel(bitsPerChannel),
      m_BigEndian(bigEndian),
      m_FloatingPoint(floatingPoint),
      m_StartOffset(startOffset) {}

}  // namespace OrloReader
