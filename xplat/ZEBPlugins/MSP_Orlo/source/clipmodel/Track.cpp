#include "clipmodel/Track.h"

#include <utility>

namespace OrloReader {

Track::Track(MediaType type) : m_Media(std::make_shared<Media>(type)) {}

Track::Track(const TimeCodeInfo& start, unsigned int sampleSize, unsigned long long sampleCount,
             unsigned char channelIndex, std::shared_ptr<AudioMediaDescriptor> descriptor)
    : m_Media(std::make_shared<Media>(std::move(descriptor), kMediaTypeAudio, start, sampleSize, sampleCount)),
      m_ChannelIndex(channelIndex) {}

Track::Track(const TimeCodeInfo& start, unsigned int sampleSize, unsigned long long sampleCount,
             unsigned char channelIndex, std::shared_ptr<AudioMediaDescriptor> descriptor,
             const ZEB::ZEBString& pathToSource, const _aafUID_t& uid)
    : m_UID(uid),
      m_Media(std::make_shared<Media>(std::move(descriptor), kMediaTypeAudio, start, sampleSize, sampleCount)),
      m_ChannelIndex(channelIndex),
      m_PathToSource(pathToSource) {}

}  // namespace OrloReader
