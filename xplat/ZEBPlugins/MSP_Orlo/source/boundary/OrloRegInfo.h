#pragma once
/// What the plug-in says of itself: identifiers, names and version.
#include "tov/tovUID.h"

namespace OrloRegInfo {

inline constexpr _tovUID Orlo_PluginID = {0xAD24BF24, 0x39B9, 0x4CA0, {0x9F, 0x35, 0x78, 0xA9, 0x6B, 0xD0, 0xE9, 0x91}};
inline constexpr _tovUID ORRIN_ZEB_VendorID = {
    0xDE75C3CF, 0xE649, 0x4F97, {0xA0, 0xB4, 0x85, 0x9B, 0xEA, 0xEB, 0x15, 0xA0}};

/// The media container's component id; also what the clips it builds name as
/// their product and their media container.
inline constexpr _tovUID CompID_OrloReaderMovContainer = {
    0x3711D3CC, 0x62D0, 0x49D7, {0xB0, 0xAE, 0xC1, 0x18, 0x10, 0x1D, 0x1A, 0x16}};

inline constexpr wchar_t kPluginName[] = L"Orlo Plug-In";
inline constexpr wchar_t kVendorName[] = L"Orrin Technology, Inc.";
inline constexpr wchar_t kDescription[] = L"Orlo * Media Stream Plug-in (MSP)";

inline constexpr unsigned int kVersionMajor = 1;
inline constexpr unsigned int kVersionMinor = 9;
inline constexpr unsigned int kVersionPatch = 1;
inline constexpr unsigned int kVersionBuild = 10178;
inline constexpr char kVersionText[] = "1.9.1.10178";
inline constexpr wchar_t kVersionWideText[] = L"1.9.1.10178";

}  // namespace OrloRegInfo
