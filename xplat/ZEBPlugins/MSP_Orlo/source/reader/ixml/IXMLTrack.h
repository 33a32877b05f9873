#pragma once
/// One TRACK of an iXML TRACK_LIST, each value with its has flag.
#include <cstdint>

#include "strings/ZEBString.h"

namespace Chunks {
namespace IXML {

class IXMLTrack {
public:
    virtual ~IXMLTrack() = default;

    const ZEB::ZEBString& GetName() const { return m_Name; }
    void SetName(const ZEB::ZEBString& name) { m_Name = name; }
    bool HasName() const { return m_HasName; }
    void SetHasName(bool has) { m_HasName = has; }

    uint16_t GetChannelIndex() const { return m_ChannelIndex; }
    void SetChannelIndex(uint16_t index) { m_ChannelIndex = index; }
    bool HasChannelIndex() const { return m_HasChannelIndex; }
    void SetHasChannelIndex(bool has) { m_HasChannelIndex = has; }

    uint16_t GetInterleaveIndex() const { return m_InterleaveIndex; }
    void SetInterleaveIndex(uint16_t index) { m_InterleaveIndex = index; }
    bool HasInterleaveIndex() const { return m_HasInterleaveIndex; }
    void SetHasInterleaveIndex(bool has) { m_HasInterleaveIndex = has; }

private:
    ZEB::ZEBString m_Name;
    uint16_t m_ChannelIndex = 0;
    uint16_t m_InterleaveIndex = 0;
    bool m_HasName = false;
    bool m_HasChannelIndex = false;
    bool m_HasInterleaveIndex = false;
};

}  // namespace IXML
}  // namespace Chunks
