// orlo: what the plug-in makes of audio files, run over the reference host.
#include <CLI/CLI.hpp>
#include <memory>
#include <vector>

#include "ChunksCommand.h"
#include "ClipCommand.h"
#include "LinkCommand.h"
#include "OrloOptions.h"
#include "OrloVersion.h"
#include "ProbeCommand.h"
#include "ReadCommand.h"
#include "VersionCommand.h"

int main(int argc, char** argv) {
    CLI::App app{"orlo: see what the plug-in makes of audio files before they reach the edit"};
    OrloOptions options;
    app.add_flag("-v,--verbose", options.verbose, "also show trace lines of the console");
    app.add_flag("-q,--quiet", options.quiet, "show only failures on the console");
    app.set_version_flag("--version", std::string("orlo ") + kOrloToolVersion);
    app.require_subcommand(0, 1);

    // Each command in a file of its own; the first is what runs with no command.
    std::vector<std::unique_ptr<OrloCommand>> commands;
    commands.push_back(std::make_unique<VersionCommand>());
    commands.push_back(std::make_unique<ChunksCommand>());
    commands.push_back(std::make_unique<ProbeCommand>());
    commands.push_back(std::make_unique<ClipCommand>());
    commands.push_back(std::make_unique<LinkCommand>());
    commands.push_back(std::make_unique<ReadCommand>());
    std::vector<CLI::App*> declared;
    for (auto& command : commands) declared.push_back(command->Declare(app));

    try {
        app.parse(argc, argv);
    } catch (const CLI::ParseError& e) {
        const int code = app.exit(e);
        return e.get_exit_code() == 0 ? code : kExitUsage;
    }
    for (size_t i = 0; i < commands.size(); ++i)
        if (declared[i]->parsed()) return commands[i]->Run(options);
    return commands.front()->Run(options);
}
