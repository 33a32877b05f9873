#include "VersionCommand.h"

#include <cstdio>
#include <nlohmann/json.hpp>

#include "OrloSession.h"
#include "OrloVersion.h"
#include "boundary/OrloRegInfo.h"

CLI::App* VersionCommand::Declare(CLI::App& app) {
    CLI::App* command = app.add_subcommand("version", "start the host and show the versions");
    command->add_flag("--json", m_Json, "machine-readable output");
    return command;
}

int VersionCommand::Run(const OrloOptions& options) {
    OrloSession session(options.Verbosity(), false);
    if (!session.Started()) return kExitFailed;
    if (m_Json) {
        const nlohmann::json out = {{"tool", kOrloToolVersion}, {"plugin", OrloRegInfo::kVersionText}};
        std::printf("%s\n", out.dump(2).c_str());
    } else {
        std::printf("orlo %s, plug-in %s\n", kOrloToolVersion, OrloRegInfo::kVersionText);
    }
    return kExitOK;
}
