#include "aafbuilder/FrameRateAndDropToString.h"

#include "clipmodel/Timecode.h"

namespace ZEB {
namespace Impl {

std::string FrameRateAndDropToString(_aafRational_t rate, bool drop) {
    const aafInt32 n = rate.numerator;
    // A zero denominator counts as no whole frames instead of faulting: the
    // base text still follows the numerator.
    const aafInt32 q = rate.denominator == 0 ? 0 : static_cast<aafInt32>(static_cast<int64_t>(n) / rate.denominator);
    const bool odd = q % 2 != 0;
    std::string text;
    if (n == 24 || n == 24000)
        text = odd ? "23.98" : "24";
    else if (n == 25 || n == 25000)
        text = "25";
    else if (n == 30 || n == 30000)
        text = odd ? "29.97" : "30";
    // Rounding the whole frames gives them back unchanged.
    const int rounded = static_cast<int>(q + 0.5);
    if (Timecode::TCFPSCanBeDF(rounded)) text += drop ? " DF" : " NDF";
    return text;
}

}  // namespace Impl
}  // namespace ZEB
