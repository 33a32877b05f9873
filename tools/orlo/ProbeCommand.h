#pragma once
#include "PluginCommand.h"

/// Makes the clip of one file in process, the way the host's container asks
/// the plug-in for it, and shows the Movie: its attributes, its tracks and the
/// console lines the plug-in wrote on the way.
class ProbeCommand : public PluginCommand {
public:
    CLI::App* Declare(CLI::App& app) override;
    /// 0 when the plug-in made a clip, 1 when it did not.
    int Run(const OrloOptions& options) override;
};
