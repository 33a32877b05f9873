#pragma once
#include "PluginCommand.h"

/// Links one file through the loaded module, as an editing host does: the
/// container's extension table, its path, support and capabilities, the clip
/// list with its AAF clip, and the sample map's answers.
class LinkCommand : public PluginCommand {
public:
    CLI::App* Declare(CLI::App& app) override;
    /// 0 when the container took the file and gave a clip and a sample map
    /// with media, 1 otherwise.
    int Run(const OrloOptions& options) override;

private:
    bool m_NoClock = false;
    std::string m_Module;
};
