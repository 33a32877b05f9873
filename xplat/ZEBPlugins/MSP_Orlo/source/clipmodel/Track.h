#pragma once
/// One track of a clip: its media, the file channel it comes from, and for a
/// grouped clip the file it lies in.
#include <cstdint>
#include <memory>

#include "aaf/AAFTypes.h"
#include "clipmodel/Media.h"
#include "strings/ZEBString.h"

namespace OrloReader {

class Track {
public:
    /// Empty media of `type`, channel 0, a zero UID and no path.
    explicit Track(MediaType type);
    /// An audio track of the clip's own file: a zero UID and an empty path.
    Track(const TimeCodeInfo& start, unsigned int sampleSize, unsigned long long sampleCount,
          unsigned char channelIndex, std::shared_ptr<AudioMediaDescriptor> descriptor);
    /// An audio track of a grouped file, which keeps its path and identity.
    Track(const TimeCodeInfo& start, unsigned int sampleSize, unsigned long long sampleCount,
          unsigned char channelIndex, std::shared_ptr<AudioMediaDescriptor> descriptor,
          const ZEB::ZEBString& pathToSource, const _aafUID_t& uid);

    const _aafUID_t& GetUID() const { return m_UID; }
    /// Never null; shared with whoever asked.
    std::shared_ptr<Media> GetMedia() const { return m_Media; }
    unsigned char GetChannelIndex() const { return m_ChannelIndex; }
    void SetChannelIndex(unsigned char index) { m_ChannelIndex = index; }
    const ZEB::ZEBString& GetPathToSource() const { return m_PathToSource; }
    void SetPathToSource(const ZEB::ZEBString& path) { m_PathToSource = path; }

private:
    _aafUID_t m_UID{};
    std::shared_ptr<Media> m_Media;
    unsigned char m_ChannelIndex = 0;
    ZEB::ZEBString m_PathToSource;
};

}  // namespace OrloReader
