#pragma once
/// The plug-in started in process, on a host whose utility library the caller
/// has started: the host's factory kept, `g_pConsole` set to the host's
/// console, the toggles registered; undone in reverse order when the object
/// goes. The loadable module's `TOVStartup` does this and more (it starts the
/// library itself, names the logger and says it is loaded); the tool's
/// in-process commands, the tests, the benchmarks and the fuzzers use this.
/// One at a time: the plug-in's globals are the process's.
#include "tov/ITOVUnknown.h"
#include "tov/TOVResult.h"

class PluginStartup {
public:
    /// Starts the plug-in on `host`, the unknown a module is handed, which
    /// must outlive this object.
    explicit PluginStartup(ITOVUnknown* host);
    ~PluginStartup();

    PluginStartup(const PluginStartup&) = delete;
    PluginStartup& operator=(const PluginStartup&) = delete;

    /// 0, or the result that stopped the start-up (what was done is undone all the same).
    TOVRESULT Result() const { return m_Result; }

private:
    TOVRESULT m_Result;
};
