#pragma once
/// The plug-in run in process as the host's container drives it: the host and
/// the utility library started, the plug-in started on them as its module
/// starts, and the user's choices stored in the host.
#include <cstdint>
#include <memory>
#include <nlohmann/json.hpp>
#include <string>

#include "OrloSession.h"
#include "PluginChoices.h"
#include "boundary/PluginStartup.h"
#include "clipmodel/Movie.h"

class PluginRun {
public:
    PluginRun(uint32_t verbosity, const PluginChoices& choices);

    /// True when everything started; otherwise it has said on stderr what did not.
    bool Started() const { return m_Started; }
    TOVHost& Host() { return m_Session.Host(); }
    /// The Movie that `NewMovieFromFilePath` makes of `path`, or null with
    /// the failing result in `result`.
    std::unique_ptr<OrloReader::Movie> NewMovie(const std::string& path, TOVRESULT& result);
    /// Stops the plug-in and gives the console lines from its start to its
    /// stop (the utility library's own start-up lines come before).
    nlohmann::ordered_json Stop();

private:
    OrloSession m_Session;
    size_t m_FirstLine;
    std::unique_ptr<PluginStartup> m_Plugin;
    bool m_Started = false;
};
