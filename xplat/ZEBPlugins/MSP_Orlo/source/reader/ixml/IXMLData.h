#pragma once
/// What the iXML chunk says, as plain values each with a has flag (all false
/// until a parse sets them). The has flag decides, not the value.
#include <cstdint>
#include <vector>

#include "reader/FlaggedField.h"
#include "reader/ixml/IXMLSpeed.h"
#include "reader/ixml/IXMLTrack.h"
#include "strings/ZEBString.h"

namespace Chunks {
namespace IXML {

class IXMLData {
public:
    virtual ~IXMLData() = default;

    /// Set at the end of a whole parse; the clip model reads it as "has iXML".
    bool parsed = false;

    ORLO_FLAGGED_FIELD(, ZEB::ZEBString, Project)
    ORLO_FLAGGED_FIELD(, ZEB::ZEBString, Scene)
    ORLO_FLAGGED_FIELD(, ZEB::ZEBString, Take)
    ORLO_FLAGGED_FIELD(, ZEB::ZEBString, UBITS)
    ORLO_FLAGGED_FIELD(, ZEB::ZEBString, Tape)
    ORLO_FLAGGED_FIELD(, ZEB::ZEBString, Notes)
    ORLO_FLAGGED_FIELD(, ZEB::ZEBString, User)
    ORLO_FLAGGED_FIELD(, ZEB::ZEBString, FileUID)
    ORLO_FLAGGED_FIELD(, uint16_t, TracksCount)
    ORLO_FLAGGED_FIELD(, std::vector<IXMLTrack>, TracksList)
    ORLO_FLAGGED_FIELD(, IXMLSpeed, Speed)
    ORLO_FLAGGED_FIELD(, bool, Circled)
    ORLO_FLAGGED_FIELD(, bool, NoGood)
    ORLO_FLAGGED_FIELD(, bool, FalseStart)
    ORLO_FLAGGED_FIELD(, bool, WildTrack)
    ORLO_FLAGGED_FIELD(, double, Version)

public:
    void AddTrackToTrackList(const IXMLTrack& track) { m_TracksList.push_back(track); }

private:
    struct HasFlags {
        bool Project = false, Scene = false, Take = false, UBITS = false, Tape = false, Notes = false, User = false,
             FileUID = false, TracksCount = false, TracksList = false, Speed = false, Circled = false, NoGood = false,
             FalseStart = false, WildTrack = false, Version = false;
    };
    HasFlags m_Has;
};

}  // namespace IXML
}  // namespace Chunks
