#pragma once
/// The SPEED element of iXML: timecode rate and flag, time stamp and
/// digitizer rates, each value with its has flag.
#include <cstdint>

#include "aaf/AAFTypes.h"
#include "reader/FlaggedField.h"

namespace Chunks {
namespace IXML {

class IXMLSpeed {
public:
    virtual ~IXMLSpeed() = default;

    /// True once a SPEED element was read.
    bool IsPresent() const { return m_Present; }
    void SetPresent(bool present) { m_Present = present; }

    ORLO_FLAGGED_FIELD(, _aafRational_t, TimeCodeRate)
    /// True for drop frame.
    ORLO_FLAGGED_FIELD(, bool, TimeCodeFlag)
    ORLO_FLAGGED_FIELD(, uint32_t, TimeStampSampleRate)
    ORLO_FLAGGED_FIELD(, uint64_t, SamplesSinceMidnight)
    ORLO_FLAGGED_FIELD(, uint32_t, DigitizerSampleRate)

private:
    struct HasFlags {
        bool TimeCodeRate = false, TimeCodeFlag = false, TimeStampSampleRate = false, SamplesSinceMidnight = false,
             DigitizerSampleRate = false;
    };
    bool m_Present = false;
    HasFlags m_Has;
};

}  // namespace IXML
}  // namespace Chunks
