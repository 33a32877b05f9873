#include "clipmodel/TimeCodeInfo.h"

#include <cstdio>

#include "clipmodel/Timecode.h"

namespace OrloReader {

TimeCodeInfo::TimeCodeInfo(int hours, int minutes, int seconds, int frames, unsigned short fps, bool drop,
                           int totalFrames)
    : m_Hours(hours),
      m_Minutes(minutes),
      m_Seconds(seconds),
      m_Frames(frames),
      m_FPS(fps),
      m_Drop(drop),
      m_TotalFrames(totalFrames) {}

void TimeCodeInfo::ToString(std::string& out) const {
    int frames = m_Frames;
    bool oddHalf = false;
    if (Timecode::TCFPSIsHighFPS(m_FPS)) {
        oddHalf = m_Frames % 2 != 0;
        frames = m_Frames / 2;
    }
    const char separator = m_Drop ? ';' : ':';
    char last = separator;
    if (oddHalf) last = m_Drop ? ',' : '.';
    // Four fields of up to eleven characters each and three separators.
    char text[64];
    std::snprintf(text, sizeof text, "%02d%c%02d%c%02d%c%02d", m_Hours, separator, m_Minutes, separator, m_Seconds,
                  last, frames);
    out = text;
}

}  // namespace OrloReader
