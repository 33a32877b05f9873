#include "clipmodel/Media.h"

#include <utility>

namespace OrloReader {

Media::Media(MediaType type) : m_Type(type) {}

Media::Media(std::shared_ptr<AudioMediaDescriptor> descriptor, MediaType type, const TimeCodeInfo& start,
             uint32_t sampleSize, uint64_t sampleCount)
    : m_Descriptor(std::move(descriptor)),
      m_Type(type),
      m_Start(start),
      m_SampleSize(sampleSize),
      m_SampleCount(sampleCount) {}

uint32_t Media::GetSampleSize(uint64_t) const {
    return m_Type == kMediaTypeAudio && m_Descriptor ? m_Descriptor->GetBytesPerPacket() : 0;
}

uint64_t Media::GetSampleOffset(uint64_t sample) const {
    const uint64_t offset = sample * GetSampleSize(sample);
    return m_Descriptor ? offset + m_Descriptor->GetStartOffset() : offset;
}

uint64_t Media::GetNumberOfContiguousSamples(uint64_t sample) const {
    return sample > m_SampleCount ? 0 : m_SampleCount - sample;
}

void Media::GetStartTimeCode(long long& frames, unsigned short& fps, bool& drop) const {
    fps = m_Start.GetFPS();
    drop = m_Start.IsDropFrame();
    // Drop-frame counting always drops two labels a minute here, whatever the rate.
    const long long f = fps;
    const long long minute = drop ? f * 60 - 2 : f * 60;
    const long long tenMinutes = drop ? minute * 10 + 2 : f * 600;
    const long long hour = drop ? tenMinutes * 6 : f * 3600;
    const long long minutes = m_Start.GetMinutes();
    frames = m_Start.GetHours() * hour + (minutes / 10) * tenMinutes + (minutes % 10) * minute +
             m_Start.GetSeconds() * f + m_Start.GetFrames();
}

}  // namespace OrloReader
