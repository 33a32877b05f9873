#include "TestHost.h"

TestHost::TestHost() : m_Host(TOVHost::Create()) {
    m_Host->Console().SetVerbosity(~0u);
    m_Host->Console().SetSink([this](uint32_t level, const std::string& line) { m_Lines.emplace_back(level, line); });
}

TestHost::~TestHost() { m_Host->UnloadAllModules(); }

std::vector<std::string> TestHost::Texts() const {
    std::vector<std::string> texts;
    for (const auto& line : m_Lines) texts.push_back(line.second);
    return texts;
}
