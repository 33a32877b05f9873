#pragma once
/// The bundled example take, examples/12A-T03.wav: one second of a 1 kHz tone
/// at -20 dBFS, 48 kHz, 24-bit stereo, with the bext and iXML chunks a field
/// recorder writes for scene 12A, take 3, starting at 01:00:00:00 at 25 fps.
/// Made byte for byte the same on every run.
#include <cstddef>
#include <string>

namespace ExampleTake {

/// The file's name in examples/.
inline constexpr char kFileName[] = "12A-T03.wav";

/// bext version 1 with the Description keywords, origination date and time,
/// the time reference of 01:00:00:00 and a UMID.
std::string BextPayload();
/// The iXML document; `padTo` fills it with blanks up to that many bytes, as
/// recorders leave room to rewrite it in place.
std::string IxmlPayload(size_t padTo = 0);
/// The samples: 48000 frames of two 24-bit channels.
std::string Samples();
/// The whole file: bext, fmt, data, then iXML.
std::string File();

}  // namespace ExampleTake
