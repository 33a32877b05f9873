#pragma once
/// The time of day of a `bext` OriginationTime field.
#include <string>

namespace Chunks {
namespace BEXT {

/// True when `time` gives a time: "hh:mm:ss" with any one of "-_: ." as the
/// separator. Minutes or seconds of 60 and more carry into the next unit. Only
/// what the text gives is written; `hours` is also read, as the upper bound
/// check of the hour looks at the caller's value (see the source).
bool ParseOriginationTime(const std::string& time, short& hours, short& minutes, short& seconds);

}  // namespace BEXT
}  // namespace Chunks
