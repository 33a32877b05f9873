#pragma once
/// A reference host for tests, whose console lines are kept instead of printed.
#include <string>
#include <utility>
#include <vector>

#include "tov/host/TOVHost.h"

class TestHost {
public:
    /// All levels shown, so tests see every line.
    TestHost();
    ~TestHost();

    TOVHost& operator*() { return *m_Host; }
    TOVHost* operator->() { return m_Host.Get(); }
    TOVHost* Get() { return m_Host.Get(); }

    /// Lines as written, with their level.
    const std::vector<std::pair<uint32_t, std::string>>& Lines() const { return m_Lines; }
    /// The texts alone.
    std::vector<std::string> Texts() const;
    void ClearLines() { m_Lines.clear(); }

private:
    TOVPtr<TOVHost> m_Host;
    std::vector<std::pair<uint32_t, std::string>> m_Lines;
};
