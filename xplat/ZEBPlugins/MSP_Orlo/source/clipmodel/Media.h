#pragma once
/// The samples of one track: where they lie in the file and how many there
/// are, and the track's start timecode.
#include <cstdint>
#include <memory>

#include "clipmodel/AudioMediaDescriptor.h"
#include "clipmodel/MediaType.h"
#include "clipmodel/TimeCodeInfo.h"

namespace OrloReader {

class Media {
public:
    /// Empty media of `type`: no descriptor, no samples.
    explicit Media(MediaType type);
    /// Shares `descriptor`, which is null for timecode.
    Media(std::shared_ptr<AudioMediaDescriptor> descriptor, MediaType type, const TimeCodeInfo& start,
          uint32_t sampleSize, uint64_t sampleCount);

    MediaType GetType() const { return m_Type; }
    uint64_t GetSampleCount() const { return m_SampleCount; }
    /// Bytes of one channel's sample as the file holds it.
    uint32_t GetChannelSampleSize() const { return m_SampleSize; }
    /// Bytes per packet for audio, otherwise 0; the argument is not used.
    uint32_t GetSampleSize(uint64_t sample) const;
    /// Where `sample` starts in the file.
    uint64_t GetSampleOffset(uint64_t sample) const;
    std::shared_ptr<AudioMediaDescriptor> GetSoundDescriptor() const { return m_Descriptor; }
    bool DoesNotDependOnOthers(uint64_t) const { return true; }
    bool IsNotDependedOnByOthers(uint64_t) const { return true; }
    /// Every 42nd sample is a sync sample; the host asks, nothing else depends on it.
    bool IsNotSync(uint64_t sample) const { return sample % 42 != 0; }
    bool IsEarlierDisplayTimesAllowed(uint64_t) const { return false; }
    uint64_t GetNumberOfContiguousSamples(uint64_t sample) const;
    uint32_t GetSampleDescriptionsCount() const { return 0; }
    uint32_t GetTimeScale() const { return 1; }

    const TimeCodeInfo& GetStartTimeCode() const { return m_Start; }
    /// The start as a frame count under its fps and drop flag.
    void GetStartTimeCode(long long& frames, unsigned short& fps, bool& drop) const;
    void SetStartTimeCode(const TimeCodeInfo& start) { m_Start = start; }

private:
    std::shared_ptr<AudioMediaDescriptor> m_Descriptor;
    MediaType m_Type;
    TimeCodeInfo m_Start;
    uint32_t m_SampleSize = 0;
    uint64_t m_SampleCount = 0;
};

}  // namespace OrloReader
