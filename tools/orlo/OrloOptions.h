#pragma once
/// Options that every command of the tool shares.
#include <cstdint>

struct OrloOptions {
    bool verbose = false;
    bool quiet = false;

    /// The console levels to show.
    uint32_t Verbosity() const;
};

/// Exit status of the tool: done, failed, or a usage error.
enum OrloExit : int { kExitOK = 0, kExitFailed = 1, kExitUsage = 2 };
