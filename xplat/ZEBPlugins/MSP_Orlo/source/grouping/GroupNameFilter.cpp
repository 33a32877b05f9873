#include "grouping/GroupNameFilter.h"

#include <stdexcept>

#include "grouping/GetFileExtension.h"
#include "grouping/UTF8Name.h"

namespace Grouping {

namespace {

char FoldedASCII(char c) { return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c; }

// Byte by byte: in well-formed UTF-8 only ASCII bytes are letters, and a
// character matches exactly when its whole sequence does.
bool SameBytes(std::string_view a, std::string_view b) {
    for (size_t i = 0; i < a.size(); ++i)
        if (FoldedASCII(a[i]) != FoldedASCII(b[i])) return false;
    return true;
}

}  // namespace

GroupNameFilter::GroupNameFilter(const ZEB::ZEBString& name, bool (*prefixOf)(ZEB::ZEBString, ZEB::ZEBString&),
                                 uint32_t variableLimit)
    : m_VariableLimit(variableLimit) {
    const bool found = prefixOf(name, m_Prefix);
    m_Extension = HelperFunctions::GetFileExtension(name);
    if (!found || m_Prefix.IsEmpty() || m_Extension.IsEmpty())
        throw std::logic_error("Failed to initialize VTImportFilter");
    m_PrefixBytes = UTF8Name(m_Prefix);
    m_ExtensionBytes = UTF8Name(m_Extension);
    m_PrefixCharacters = CountUTF8Characters(m_PrefixBytes).value_or(0);
    m_ExtensionCharacters = CountUTF8Characters(m_ExtensionBytes).value_or(0);
}

bool GroupNameFilter::operator()(std::string_view name) const {
    const std::optional<uint32_t> characters = CountUTF8Characters(name);
    if (!characters) return false;
    if (name.size() < m_PrefixBytes.size() || !SameBytes(m_PrefixBytes, name.substr(0, m_PrefixBytes.size())))
        return false;
    if (name.size() < m_ExtensionBytes.size() ||
        !SameBytes(m_ExtensionBytes, name.substr(name.size() - m_ExtensionBytes.size())))
        return false;
    // Unsigned on purpose: a prefix and an extension that overlap in a short
    // name leave a huge count, which the limit refuses.
    return *characters - m_PrefixCharacters - m_ExtensionCharacters < m_VariableLimit;
}

}  // namespace Grouping
