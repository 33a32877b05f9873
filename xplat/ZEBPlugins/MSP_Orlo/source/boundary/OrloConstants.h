#pragma once
/// Constants that every part of the plug-in shares. Plain static data,
/// standing before the module starts.

/// Dynamic toggle paths, registered at start-up with the value 0 (off).
/// Tries the iXML file UID as the Mob ID before the bext UMID.
inline constexpr const char* toggle_MobIDFromiXML = "/OrloReaderMovMediaContainer/MobIDFromiXML";
/// Takes the file's creation time as the start when nothing else gives one.
inline constexpr const char* toggle_StartTimeCodeFromFileCreationTime =
    "/OrloReaderMovMediaContainer/StartTimeCodeFromFileCreationTime";
/// A bext time reference of zero counts as absent, so the origination time is
/// tried. The name and the path differ, and both are kept as they are.
inline constexpr const char* toggle_StartTimeCodeFromBEXTOriginationDate =
    "/OrloReaderMovMediaContainer/AudioTimecodeUseBEXTOriginationDate";
/// Takes the bext UMID's material number in its stored byte order.
inline constexpr const char* toggle_BigEndianSmpteIdInBEXTData =
    "/OrloReaderMovMediaContainer/BigEndianSmpteIdInBEXTData";
/// Makes no host settings object, so that the grouping default stands.
inline constexpr const char* toggle_IgnoreHostSettingsForUnitTest =
    "/OrloReaderMovMediaContainer/IgnoreHostSettingsForUnitTest";

/// The feature group all the toggles are registered in.
inline constexpr const char* kOrloFeatureGroup = "orrin.released.features";

/// One row of the file name extensions the container offers the host's file
/// dialogs: no dot, upper case.
struct OrloFileExtension {
    const char* extension;
    const char* shortName;
    const char* description;
};

/// The container's extension table, in the order the host is told it.
inline constexpr OrloFileExtension kOrloFileExtensions[] = {
    {"WAV", "WAV Files", "Waveform Audio File Format"},      {"WAVE", "WAVE Files", "Waveform Audio File Format"},
    {"BWF", "BWF Files", "Broadcast Wave Format"},           {"AIF", "AIF Files", "Audio Interchange File Format"},
    {"AIFF", "AIFF Files", "Audio Interchange File Format"}, {"AIFC", "AIFC Files", "Audio Interchange File Format"},
    {"CDDA", "CDDA Files", "Compact Disc Digital Audio"},
};
