#pragma once
#include "PluginCommand.h"

/// Makes the AAF clip of one file in process, as the host's container will:
/// the Movie, then its transient AAF file, shown through the AAF dump.
class ClipCommand : public PluginCommand {
public:
    CLI::App* Declare(CLI::App& app) override;
    /// 0 when the plug-in made the clip, 1 when it did not.
    int Run(const OrloOptions& options) override;

private:
    bool m_NoClock = false;
};
