#pragma once
/// The frame rate as the host's bin column shows it.
#include <string>

#include "aaf/AAFTypes.h"

namespace ZEB {
namespace Impl {

/// "23.98" or "24" for a numerator of 24 or 24000, "25" for 25 or 25000,
/// "29.97" or "30" for 30 or 30000 (the first when the whole frames are odd),
/// else empty; then " DF" or " NDF" when the whole frames are 30 or 60. So
/// 29.97 never carries a drop suffix and 60 has a suffix alone.
std::string FrameRateAndDropToString(_aafRational_t rate, bool drop);

}  // namespace Impl
}  // namespace ZEB
