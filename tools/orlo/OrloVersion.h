#pragma once
/// The tool's own version.
inline constexpr char kOrloToolVersion[] = "0.1.0";
