#pragma once
/// One run of the tool over the reference host: starts the host and the
/// utility library, and takes both down again.
#include <string>
#include <vector>

#include "tov/host/TOVHost.h"

class OrloSession {
public:
    /// Starts the host with console output at `verbosity`; console lines go to
    /// stderr, and also into `ConsoleLines()` when `capture` is set.
    OrloSession(uint32_t verbosity, bool capture);
    ~OrloSession();

    OrloSession(const OrloSession&) = delete;
    OrloSession& operator=(const OrloSession&) = delete;

    /// The result of starting the utility library.
    TOVRESULT StartResult() const { return m_StartResult; }
    /// True when the host's services started; otherwise says so on stderr.
    bool Started() const;
    TOVHost& Host() { return *m_Host; }
    const std::vector<std::string>& ConsoleLines() const { return m_Lines; }

private:
    TOVPtr<TOVHost> m_Host;
    std::vector<std::string> m_Lines;
    TOVRESULT m_StartResult;
};
