#pragma once
/// The samples of the examples: a sine tone at -20 dBFS, 24-bit, one second
/// at 48 kHz, the same in every channel, made byte for byte the same on every run.
#include <cstdint>
#include <string>

namespace ExampleTone {

inline constexpr uint32_t kRate = 48000;

/// 48000 frames of `channels` 24-bit little-endian samples; `hertz` must
/// divide 48000, so that the second holds whole periods.
std::string Samples(uint32_t hertz, int channels);

}  // namespace ExampleTone
