#pragma once
/// A frame rate as a rational and as frames per second, with drop frame.
#include "aaf/AAFTypes.h"

namespace OrloReader {

class FrameRateSettings {
public:
    /// Rate 0/1, 0.0 fps, no drop frame: a rate not yet decided.
    FrameRateSettings();
    /// Each form sets the rate as its setter of the same kind does.
    FrameRateSettings(_aafRational_t rate, bool drop);
    FrameRateSettings(double fps, bool drop);
    FrameRateSettings(int fps, bool drop);

    /// The rate as given; fps = numerator / denominator.
    void SetRationalFramerate(_aafRational_t rate, bool drop);
    /// fps as given; the rate the nearest known one.
    void SetFloatingFramerate(double fps, bool drop);
    /// The rate of an integer video rate; fps = numerator / denominator.
    void SetIntegerFramerate(int fps, bool drop);
    /// Sets the flag alone, whatever the rate.
    void SetDropFrame(bool drop) { m_DropFrame = drop; }

    _aafRational_t GetRationalFramerate() const { return m_Rate; }
    double GetFloatingFrameRate() const { return m_FPS; }
    bool GetDropFrame() const { return m_DropFrame; }

private:
    /// The request, kept only when the rounded rate can be drop frame.
    void SetDropFrameIfAllowed(bool drop);

    _aafRational_t m_Rate;
    double m_FPS;
    bool m_DropFrame;
};

}  // namespace OrloReader
