#pragma once
/// The feature toggles of one host, in order of registration. Shared by every
/// toggle manager object of that host; like the rest of the host it serves one
/// thread at a time. A handful of toggles is the normal case, so they are
/// looked up by walking the list.
#include <cstdint>
#include <string>
#include <vector>

#include "tov/TOVResult.h"

class HostToggleStore {
public:
    struct Toggle {
        std::string path;
        std::string group;
        uint32_t defaultValue;
        uint32_t value;
    };

    /// Adds `path` at the end with `defaultValue` as its value. A path
    /// registered already is ZEB_E_ALREADYSET and keeps its value.
    TOVRESULT Register(const std::string& path, uint32_t defaultValue, const std::string& group);
    /// The toggle at `path`, or null; valid until the next Register or Unregister.
    Toggle* Find(const std::string& path);
    /// Forgets the toggle at `path`; ZEB_E_NOTFOUND when there is none.
    TOVRESULT Unregister(const std::string& path);
    /// All toggles, in order of registration.
    const std::vector<Toggle>& Toggles() const { return m_Toggles; }

private:
    std::vector<Toggle>::iterator Locate(const std::string& path);

    std::vector<Toggle> m_Toggles;
};
