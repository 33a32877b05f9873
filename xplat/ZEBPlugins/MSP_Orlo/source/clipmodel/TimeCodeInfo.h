#pragma once
/// One start timecode as people read it: displayed fields, rate, drop frame,
/// and the frame count they were made from.
#include <string>

namespace OrloReader {

class TimeCodeInfo {
public:
    /// `totalFrames` -1: no count is known.
    TimeCodeInfo(int hours = 0, int minutes = 0, int seconds = 0, int frames = 0, unsigned short fps = 0,
                 bool drop = false, int totalFrames = -1);

    int GetHours() const { return m_Hours; }
    int GetMinutes() const { return m_Minutes; }
    int GetSeconds() const { return m_Seconds; }
    int GetFrames() const { return m_Frames; }
    unsigned short GetFPS() const { return m_FPS; }
    bool IsDropFrame() const { return m_Drop; }
    int GetTotalFrames() const { return m_TotalFrames; }

    void SetHours(int hours) { m_Hours = hours; }
    void SetMinutes(int minutes) { m_Minutes = minutes; }
    void SetSeconds(int seconds) { m_Seconds = seconds; }
    void SetFrames(int frames) { m_Frames = frames; }
    void SetFPS(unsigned short fps) { m_FPS = fps; }
    void SetDropFrame(bool drop) { m_Drop = drop; }
    void SetTotalFrames(int totalFrames) { m_TotalFrames = totalFrames; }

    /// Replaces `out` with hh:mm:ss:ff, ";" for drop frame. At 48, 50 and 60
    /// fps the frames are shown as pairs, the odd one of a pair marked by "."
    /// (non-drop) or "," (drop) before the frames.
    void ToString(std::string& out) const;

private:
    int m_Hours;
    int m_Minutes;
    int m_Seconds;
    int m_Frames;
    unsigned short m_FPS;
    bool m_Drop;
    int m_TotalFrames;
};

}  // namespace OrloReader
