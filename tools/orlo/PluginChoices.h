#pragma once
/// What a user of the host chooses before a file is linked: values for the
/// plug-in's toggles and the host's grouping setting. Commands that run the
/// plug-in take them from the same options.
#include <CLI/CLI.hpp>
#include <string>
#include <vector>

#include "tov/TOVResult.h"
#include "tov/host/TOVHost.h"

class PluginChoices {
public:
    /// Adds `--toggle PATH=VALUE` (repeatable) and `--no-autodetect-groups` to `command`.
    void Declare(CLI::App& command);
    /// Stores the choices in `host`, as a user's choices in the host would
    /// stand; says on stderr what could not be stored.
    TOVRESULT Apply(TOVHost& host) const;

private:
    /// Each a PATH=VALUE that ToggleSetting::Parse accepted.
    std::vector<std::string> m_ToggleTexts;
    bool m_NoAutodetectGroups = false;
};
