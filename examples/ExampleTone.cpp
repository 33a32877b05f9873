#include "ExampleTone.h"

#include <cmath>

#include "Bytes.h"

namespace ExampleTone {

std::string Samples(uint32_t hertz, int channels) {
    // Each value of one period is rounded once, so the bytes do not depend on
    // how the period is stepped through.
    const uint32_t period = kRate / hertz;
    const double pi = std::acos(-1.0);
    std::string onePeriod;
    for (uint32_t i = 0; i < period; ++i) {
        const auto value = static_cast<int32_t>(std::lround(0.1 * 8388607.0 * std::sin(2.0 * pi * i / period)));
        const std::string sample = Bytes::LE32(static_cast<uint32_t>(value)).substr(0, 3);
        for (int c = 0; c < channels; ++c) onePeriod += sample;
    }
    std::string samples;
    for (uint32_t done = 0; done < kRate; done += period) samples += onePeriod;
    return samples;
}

}  // namespace ExampleTone
