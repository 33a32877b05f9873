#pragma once
/// One `--toggle PATH=VALUE` of the command line: a value for one of the
/// plug-in's dynamic toggles.
#include <cstdint>
#include <string>

struct ToggleSetting {
    std::string path;
    uint32_t value = 0;

    /// Reads "PATH=VALUE" into `out`. PATH must be one of the plug-in's five
    /// toggle paths and VALUE an unsigned decimal number that fits 32 bits.
    /// Returns what is wrong, for a usage message, or an empty text when `out`
    /// is filled.
    static std::string Parse(const std::string& text, ToggleSetting& out);
};
