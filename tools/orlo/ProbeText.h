#pragma once
/// `orlo probe`'s report for a person: one aligned line per clip attribute,
/// then a table of the tracks.
#include <nlohmann/json.hpp>

/// Prints `report` (as `orlo probe --json` gives it, console lines left out)
/// to stdout.
void PrintProbeText(const nlohmann::ordered_json& report);
