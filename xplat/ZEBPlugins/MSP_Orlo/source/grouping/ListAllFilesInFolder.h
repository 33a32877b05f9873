#pragma once
/// The entries of one folder that a filter accepts.
#include <dirent.h>

#include <exception>
#include <memory>
#include <string_view>
#include <vector>

#include "strings/ZEBString.h"

namespace HelperFunctions {

/// Appends to `out`, as UTF-8 strings, the names of `folder`'s entries that
/// `filter` accepts, in the order the file system gives them. Sub-folders are
/// left out when the file system says so; other entries go to the filter as
/// their bare name's bytes. True when at least one name was added. False when
/// the folder cannot be opened, or when a std::exception ends the listing;
/// other exceptions pass through.
template <class Filter>
bool ListAllFilesInFolder(ZEB::ZEBString folder, std::vector<ZEB::ZEBString>& out, Filter filter) {
    const size_t before = out.size();
    folder.ConvertTo(kTOVUnicodeUTF8);
    try {
        const std::unique_ptr<DIR, int (*)(DIR*)> entries(
            opendir(reinterpret_cast<const char*>(folder.GetUTF8String())), &closedir);
        if (!entries) return false;
        while (const dirent* entry = readdir(entries.get())) {
            if (entry->d_type == DT_DIR) continue;
            if (filter(std::string_view(entry->d_name)))
                out.push_back(ZEB::ZEBString(reinterpret_cast<const unsigned char*>(entry->d_name)));
        }
    } catch (const std::exception&) {
        return false;
    }
    return out.size() > before;
}

}  // namespace HelperFunctions
