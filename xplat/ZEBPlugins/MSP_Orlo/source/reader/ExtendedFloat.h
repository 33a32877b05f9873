#pragma once
/// The 80-bit IEEE 754 extended number of an AIFF sample rate.

namespace HelperFunctions {

/// The ten big-endian bytes as a double. Clears the sign bit in `bytes[0]`.
double Convert_from_IEEE_754(unsigned char* bytes);

}  // namespace HelperFunctions
