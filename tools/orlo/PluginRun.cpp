#include "PluginRun.h"

#include <vector>

#include "ResultText.h"
#include "boundary/NewMovieFromFilePath.h"

PluginRun::PluginRun(uint32_t verbosity, const PluginChoices& choices)
    : m_Session(verbosity, true), m_FirstLine(m_Session.ConsoleLines().size()) {
    if (!m_Session.Started()) return;
    m_Plugin = std::make_unique<PluginStartup>(m_Session.Host().AsUnknown());
    if (SayRefused(m_Plugin->Result(), "the plug-in did not start") < 0) return;
    m_Started = choices.Apply(m_Session.Host()) >= 0;
}

std::unique_ptr<OrloReader::Movie> PluginRun::NewMovie(const std::string& path, TOVRESULT& result) {
    OrloReader::Movie* movie = nullptr;
    result = ZEB::Impl::NewMovieFromFilePath(ZEB::ZEBString(reinterpret_cast<const unsigned char*>(path.c_str())),
                                             &movie, &m_Session.Host());
    std::unique_ptr<OrloReader::Movie> owned(movie);
    if (result != TOV_OK) owned.reset();
    return owned;
}

nlohmann::ordered_json PluginRun::Stop() {
    m_Plugin.reset();
    const auto& lines = m_Session.ConsoleLines();
    return std::vector<std::string>(lines.begin() + static_cast<long>(m_FirstLine), lines.end());
}
