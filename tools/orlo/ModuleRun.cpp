#include "ModuleRun.h"

#include <unistd.h>

#include <cstdio>
#include <vector>

ModuleRun::ModuleRun(uint32_t verbosity, const PluginChoices& choices, const std::string& modulePath)
    : m_Session(verbosity, true), m_FirstLine(m_Session.ConsoleLines().size()) {
    if (!m_Session.Started()) return;
    std::string error;
    const TOVRESULT loaded = m_Session.Host().LoadModule(modulePath, error);
    if (loaded < 0) {
        std::fprintf(stderr, "orlo: %s (0x%08X)\n", error.c_str(), static_cast<unsigned>(loaded));
        return;
    }
    m_Started = choices.Apply(m_Session.Host()) >= 0;
}

std::string ModuleRun::DefaultModulePath() {
    std::vector<char> buffer(4096);
    const ssize_t length = readlink("/proc/self/exe", buffer.data(), buffer.size() - 1);
    std::string self = length > 0 ? std::string(buffer.data(), static_cast<size_t>(length)) : std::string();
    const size_t slash = self.rfind('/');
    return (slash == std::string::npos ? std::string(".") : self.substr(0, slash)) + "/MSP_Orlo.so";
}

nlohmann::ordered_json ModuleRun::Stop() {
    m_Session.Host().UnloadAllModules();
    const auto& lines = m_Session.ConsoleLines();
    return std::vector<std::string>(lines.begin() + static_cast<long>(m_FirstLine), lines.end());
}
