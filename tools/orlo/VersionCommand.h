#pragma once
#include "OrloCommand.h"

/// Starts the host and the utility library and shows the versions.
class VersionCommand : public OrloCommand {
public:
    CLI::App* Declare(CLI::App& app) override;
    int Run(const OrloOptions& options) override;

private:
    bool m_Json = false;
};
