#include "OrloOptions.h"

#include "tov/ITOVConsole.h"
#include "tov/host/HostConsole.h"

uint32_t OrloOptions::Verbosity() const {
    if (quiet) return kTOVDebugLevelError;
    return verbose ? HostConsole::kDefaultVerbosity | kTOVDebugLevelTrace : HostConsole::kDefaultVerbosity;
}
