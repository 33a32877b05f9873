#pragma once
/// One subcommand of the tool: it declares its options on its CLI11 subcommand
/// and runs when chosen.
#include <CLI/CLI.hpp>

#include "OrloOptions.h"

class OrloCommand {
public:
    virtual ~OrloCommand() = default;
    /// Adds the subcommand and its options to `app`; returns the subcommand.
    virtual CLI::App* Declare(CLI::App& app) = 0;
    /// Runs with the parsed options; returns the exit status.
    virtual int Run(const OrloOptions& options) = 0;
};
