#pragma once
/// The SPEED element of iXML: timecode rate and flag, time stamp and
/// digitizer rates, each value with its has flag.
#include <cstdint>

#include "aaf/AAFTypes.h"

namespace Chunks {
namespace IXML {

class IXMLSpeed {
public:
    virtual ~IXMLSpeed() = default;

    /// True once a SPEED element was read.
    bool IsPresent() const { return m_Present; }
    void SetPresent(bool present) { m_Present = present; }

    const _aafRational_t& GetTimeCodeRate() const { return m_TimeCodeRate; }
    void SetTimeCodeRate(const _aafRational_t& rate) { m_TimeCodeRate = rate; }
    bool HasTimeCodeRate() const { return m_HasTimeCodeRate; }
    void SetHasTimeCodeRate(bool has) { m_HasTimeCodeRate = has; }

    /// True for drop frame.
    bool GetTimeCodeFlag() const { return m_TimeCodeFlag; }
    void SetTimeCodeFlag(bool drop) { m_TimeCodeFlag = drop; }
    bool HasTimeCodeFlag() const { return m_HasTimeCodeFlag; }
    void SetHasTimeCodeFlag(bool has) { m_HasTimeCodeFlag = has; }

    uint32_t GetTimeStampSampleRate() const { return m_TimeStampSampleRate; }
    void SetTimeStampSampleRate(uint32_t rate) { m_TimeStampSampleRate = rate; }
    bool HasTimeStampSampleRate() const { return m_HasTimeStampSampleRate; }
    void SetHasTimeStampSampleRate(bool has) { m_HasTimeStampSampleRate = has; }

    uint64_t GetSamplesSinceMidnight() const { return m_SamplesSinceMidnight; }
    void SetSamplesSinceMidnight(uint64_t samples) { m_SamplesSinceMidnight = samples; }
    bool HasSamplesSinceMidnight() const { return m_HasSamplesSinceMidnight; }
    void SetHasSamplesSinceMidnight(bool has) { m_HasSamplesSinceMidnight = has; }

    uint32_t GetDigitizerSampleRate() const { return m_DigitizerSampleRate; }
    void SetDigitizerSampleRate(uint32_t rate) { m_DigitizerSampleRate = rate; }
    bool HasDigitizerSampleRate() const { return m_HasDigitizerSampleRate; }
    void SetHasDigitizerSampleRate(bool has) { m_HasDigitizerSampleRate = has; }

private:
    bool m_Present = false;
    _aafRational_t m_TimeCodeRate{0, 0};
    bool m_TimeCodeFlag = false;
    uint32_t m_TimeStampSampleRate = 0;
    uint64_t m_SamplesSinceMidnight = 0;
    uint32_t m_DigitizerSampleRate = 0;
    bool m_HasTimeCodeRate = false;
    bool m_HasTimeCodeFlag = false;
    bool m_HasTimeStampSampleRate = false;
    bool m_HasSamplesSinceMidnight = false;
    bool m_HasDigitizerSampleRate = false;
};

}  // namespace IXML
}  // namespace Chunks
