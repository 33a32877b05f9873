#include "OrloSession.h"

#include <cstdio>

#include "startup/ZEBUtilLib.h"

OrloSession::OrloSession(uint32_t verbosity, bool capture) : m_Host(TOVHost::Create()) {
    HostConsole& console = m_Host->Console();
    console.SetVerbosity(verbosity);
    console.SetSink([this, capture](uint32_t, const std::string& line) {
        std::fprintf(stderr, "%s\n", line.c_str());
        if (capture) m_Lines.push_back(line);
    });
    m_StartResult = ZEB::ZEBInitialize(m_Host.Get());
}

OrloSession::~OrloSession() {
    if (m_StartResult >= 0) ZEB::ZEBTerminate();
    m_Host->UnloadAllModules();
}

bool OrloSession::Started() const {
    if (m_StartResult >= 0) return true;
    std::fprintf(stderr, "orlo: the host's services did not start (0x%08X)\n", static_cast<unsigned>(m_StartResult));
    return false;
}
