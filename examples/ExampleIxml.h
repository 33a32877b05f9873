#pragma once
/// Elements of the examples' iXML documents, laid out as a field recorder
/// writes them, indented for their place below the root.
#include <cstdint>
#include <string>

namespace ExampleIxml {

/// SPEED at 25 fps non-drop and 48 kHz, 24-bit, starting `samplesSinceMidnight`.
std::string Speed(uint64_t samplesSinceMidnight);
/// One TRACK of a TRACK_LIST, a microphone's.
std::string Track(int channelIndex, int interleaveIndex, const std::string& name);

}  // namespace ExampleIxml
