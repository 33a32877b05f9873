#include "PluginCommand.h"

CLI::App* PluginCommand::DeclareOn(CLI::App& app, const std::string& name, const std::string& description) {
    CLI::App* command = app.add_subcommand(name, description);
    command->add_option("FILE", m_Path, "a WAV, Broadcast Wave, RF64, AIFF or AIFF-C file")->required();
    command->add_flag("--json", m_Json, "one JSON object instead of text");
    m_Choices.Declare(*command);
    return command;
}
