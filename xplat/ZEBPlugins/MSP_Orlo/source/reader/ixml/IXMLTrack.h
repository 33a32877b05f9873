#pragma once
/// One TRACK of an iXML TRACK_LIST, each value with its has flag.
#include <cstdint>

#include "reader/FlaggedField.h"
#include "strings/ZEBString.h"

namespace Chunks {
namespace IXML {

class IXMLTrack {
public:
    virtual ~IXMLTrack() = default;

    ORLO_FLAGGED_FIELD(, ZEB::ZEBString, Name)
    ORLO_FLAGGED_FIELD(, uint16_t, ChannelIndex)
    ORLO_FLAGGED_FIELD(, uint16_t, InterleaveIndex)

private:
    struct HasFlags {
        bool Name = false, ChannelIndex = false, InterleaveIndex = false;
    };
    HasFlags m_Has;
};

}  // namespace IXML
}  // namespace Chunks
