#include "time/ConvertTCToFrames.h"

#include <cstring>

#include "strings/ZEBString.h"
#include "time/TCFrameRates.h"

namespace ZEB {
namespace {

unsigned int FramesOf(unsigned int hours, unsigned int minutes, unsigned int seconds, unsigned int frames,
                      unsigned int fps, bool drop) {
    const unsigned int dropped = drop ? TCGetNumFramesDroppedPerMinute(fps) : 0;
    const unsigned int minute = fps * 60 - dropped;
    const unsigned int tenMinutes = drop ? minute * 10 + dropped : fps * 600;
    const unsigned int hour = drop ? tenMinutes * 6 : fps * 3600;
    return hour * hours + tenMinutes * (minutes / 10) + minute * (minutes % 10) + fps * seconds + frames;
}

}  // namespace

TOVRESULT ConvertTCToFrames(unsigned int hours, unsigned int minutes, unsigned int seconds, unsigned int frames,
                            unsigned int fps, bool drop, unsigned int* out) {
    *out = FramesOf(hours, minutes, seconds, frames, fps, drop);
    return TOV_OK;
}

void ConvertTCStringToFrames(ITOVString* text, unsigned int fps, bool drop, unsigned int& out) {
    const ZEBString utf8(kTOVUnicodeUTF8, text);
    const char* bytes = reinterpret_cast<const char*>(utf8.GetUTF8String());
    // Frames, seconds, minutes, hours; each read units first.
    unsigned short fields[4] = {0, 0, 0, 0};
    int digit = 0;
    for (std::size_t i = std::strlen(bytes); i > 0 && digit < 8; --i) {
        const char c = bytes[i - 1];
        if (c < '0' || c > '9') continue;
        fields[digit / 2] += static_cast<unsigned short>((c - '0') * (digit % 2 == 0 ? 1 : 10));
        ++digit;
    }
    out = FramesOf(fields[3], fields[2], fields[1], fields[0], fps, drop);
}

}  // namespace ZEB
