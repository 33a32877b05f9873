#pragma once
/// The bundled example group, examples/group/: take 2 of scene 14B as a field
/// recorder writes it in mono mode, one Broadcast Wave file per channel named
/// by a numbered suffix (14B-T02_1.wav for the boom, _2 and _3 for two
/// radio mics). Each file is one second of a tone of its own, 48 kHz, 24-bit,
/// starting at 10:23:41:00 at 25 fps, with bext (version 1, a UMID of its
/// own) and iXML (the take's values and a track list naming its channel).
/// Made byte for byte the same on every run.
#include <string>

namespace ExampleGroup {

/// The folder below examples/ that holds the group.
inline constexpr char kFolder[] = "group";
/// The members are channels 1 to kChannels.
inline constexpr int kChannels = 3;

/// "14B-T02_<channel>.wav".
std::string FileName(int channel);
/// The track name a member's iXML gives its channel.
std::string TrackName(int channel);
std::string BextPayload(int channel);
std::string IxmlPayload(int channel);
/// The whole file: bext, fmt, data, then iXML.
std::string File(int channel);

}  // namespace ExampleGroup
