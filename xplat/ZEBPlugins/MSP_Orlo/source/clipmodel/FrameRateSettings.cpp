#include "clipmodel/FrameRateSettings.h"

#include "clipmodel/FrameRateTable.h"
#include "clipmodel/Timecode.h"
#include "clipmodel/TruncateToInteger.h"

namespace OrloReader {

namespace {

double FPSOf(const _aafRational_t& rate) {
    return static_cast<double>(rate.numerator) / static_cast<double>(rate.denominator);
}

}  // namespace

FrameRateSettings::FrameRateSettings() : m_Rate{0, 1}, m_FPS(0.0), m_DropFrame(false) {}

FrameRateSettings::FrameRateSettings(_aafRational_t rate, bool drop) : FrameRateSettings() {
    SetRationalFramerate(rate, drop);
}

FrameRateSettings::FrameRateSettings(double fps, bool drop) : FrameRateSettings() { SetFloatingFramerate(fps, drop); }

FrameRateSettings::FrameRateSettings(int fps, bool drop) : FrameRateSettings() { SetIntegerFramerate(fps, drop); }

void FrameRateSettings::SetRationalFramerate(_aafRational_t rate, bool drop) {
    m_Rate = rate;
    m_FPS = FPSOf(rate);
    SetDropFrameIfAllowed(drop);
}

void FrameRateSettings::SetFloatingFramerate(double fps, bool drop) {
    HelperFunctions::RationalRateFromFPS(fps, m_Rate);
    m_FPS = fps;
    SetDropFrameIfAllowed(drop);
}

void FrameRateSettings::SetIntegerFramerate(int fps, bool drop) {
    HelperFunctions::RationalVideoRateFromFPS(fps, m_Rate);
    m_FPS = FPSOf(m_Rate);
    SetDropFrameIfAllowed(drop);
}

void FrameRateSettings::SetDropFrameIfAllowed(bool drop) {
    m_DropFrame = drop && Timecode::TCFPSCanBeDF(HelperFunctions::TruncateToInt32(m_FPS + 0.5));
}

}  // namespace OrloReader
