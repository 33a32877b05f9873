#include "tov/host/HostToggleStore.h"

#include <algorithm>

TOVRESULT HostToggleStore::Register(const std::string& path, uint32_t defaultValue, const std::string& group) {
    if (Find(path)) return ZEB_E_ALREADYSET;
    m_Toggles.push_back(Toggle{path, group, defaultValue, defaultValue});
    return TOV_OK;
}

HostToggleStore::Toggle* HostToggleStore::Find(const std::string& path) {
    auto it = Locate(path);
    return it == m_Toggles.end() ? nullptr : &*it;
}

TOVRESULT HostToggleStore::Unregister(const std::string& path) {
    auto it = Locate(path);
    if (it == m_Toggles.end()) return ZEB_E_NOTFOUND;
    m_Toggles.erase(it);
    return TOV_OK;
}

std::vector<HostToggleStore::Toggle>::iterator HostToggleStore::Locate(const std::string& path) {
    return std::find_if(m_Toggles.begin(), m_Toggles.end(), [&](const Toggle& t) { return t.path == path; });
}
