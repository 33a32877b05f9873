#pragma once
/// A command that runs the plug-in in process on one file, as the host's
/// container would: the file, `--json`, and the user's choices.
#include <string>

#include "OrloCommand.h"
#include "PluginChoices.h"

class PluginCommand : public OrloCommand {
protected:
    /// Adds the subcommand `name` with FILE, `--json` and the choices.
    CLI::App* DeclareOn(CLI::App& app, const std::string& name, const std::string& description);

    std::string m_Path;
    bool m_Json = false;
    PluginChoices m_Choices;
};
