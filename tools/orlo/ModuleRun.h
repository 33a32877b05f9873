#pragma once
/// The plug-in as an editing host runs it: the host started, the module loaded
/// from disk (registered, started), the user's choices stored in the host, and
/// at the end the module shut down and unloaded.
#include <cstdint>
#include <nlohmann/json.hpp>
#include <string>

#include "OrloSession.h"
#include "PluginChoices.h"

class ModuleRun {
public:
    /// Loads the module at `modulePath`; says on stderr what failed, naming the path.
    ModuleRun(uint32_t verbosity, const PluginChoices& choices, const std::string& modulePath);

    /// The module that sits beside the running `orlo` executable.
    static std::string DefaultModulePath();

    /// True when the host started, the module loaded and the choices stood.
    bool Started() const { return m_Started; }
    TOVHost& Host() { return m_Session.Host(); }
    /// Unloads the module and gives the console lines from its loading on.
    nlohmann::ordered_json Stop();

private:
    OrloSession m_Session;
    size_t m_FirstLine;
    bool m_Started = false;
};
