#pragma once
/// The plug-in started in process as its module start-up does it: the host's
/// factory kept, `g_pConsole` set to the host's console, the toggles
/// registered. Undone in reverse order when the object goes. One at a time:
/// the plug-in's globals are the process's.
#include "tov/TOVResult.h"
#include "tov/host/TOVHost.h"

class PluginStartup {
public:
    /// Starts the plug-in on `host`, which must outlive this object.
    explicit PluginStartup(TOVHost& host);
    ~PluginStartup();

    PluginStartup(const PluginStartup&) = delete;
    PluginStartup& operator=(const PluginStartup&) = delete;

    /// 0, or the result that stopped the start-up (what was done is undone all the same).
    TOVRESULT Result() const { return m_Result; }

private:
    TOVRESULT m_Result;
};
