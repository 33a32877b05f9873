#pragma once
/// What the iXML chunk says, as plain values each with a has flag (all false
/// until a parse sets them). The has flag decides, not the value.
#include <cstdint>
#include <vector>

#include "reader/ixml/IXMLSpeed.h"
#include "reader/ixml/IXMLTrack.h"
#include "strings/ZEBString.h"

namespace Chunks {
namespace IXML {

// Get, Set, Has and SetHas of one value and its flag.
#define IXML_DATA_FIELD(Type, Name)                         \
public:                                                     \
    const Type& Get##Name() const { return m_##Name; }      \
    void Set##Name(const Type& value) { m_##Name = value; } \
    bool Has##Name() const { return m_Has##Name; }          \
    void SetHas##Name(bool has) { m_Has##Name = has; }      \
                                                            \
private:                                                    \
    Type m_##Name{};                                        \
    bool m_Has##Name = false;

class IXMLData {
public:
    virtual ~IXMLData() = default;

    /// Set at the end of a whole parse; the clip model reads it as "has iXML".
    bool parsed = false;

    IXML_DATA_FIELD(ZEB::ZEBString, Project)
    IXML_DATA_FIELD(ZEB::ZEBString, Scene)
    IXML_DATA_FIELD(ZEB::ZEBString, Take)
    IXML_DATA_FIELD(ZEB::ZEBString, UBITS)
    IXML_DATA_FIELD(ZEB::ZEBString, Tape)
    IXML_DATA_FIELD(ZEB::ZEBString, Notes)
    IXML_DATA_FIELD(ZEB::ZEBString, User)
    IXML_DATA_FIELD(ZEB::ZEBString, FileUID)
    IXML_DATA_FIELD(uint16_t, TracksCount)
    IXML_DATA_FIELD(std::vector<IXMLTrack>, TracksList)
    IXML_DATA_FIELD(IXMLSpeed, Speed)
    IXML_DATA_FIELD(bool, Circled)
    IXML_DATA_FIELD(bool, NoGood)
    IXML_DATA_FIELD(bool, FalseStart)
    IXML_DATA_FIELD(bool, WildTrack)
    IXML_DATA_FIELD(double, Version)

public:
    void AddTrackToTrackList(const IXMLTrack& track) { m_TracksList.push_back(track); }
};

#undef IXML_DATA_FIELD

}  // namespace IXML
}  // namespace Chunks
