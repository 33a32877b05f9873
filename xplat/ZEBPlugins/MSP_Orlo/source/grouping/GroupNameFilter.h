#pragma once
/// What the names of a group's files share: a prefix, an extension, and
/// between them a part of a few characters.
#include <cstdint>
#include <string>
#include <string_view>

#include "strings/ZEBString.h"

namespace Grouping {

class GroupNameFilter {
public:
    /// True when `name` starts with the prefix and ends with the extension,
    /// ASCII letters matching in either case and every other character
    /// exactly, and the name's characters less those of the prefix and the
    /// extension, taken as an unsigned 32-bit number, are fewer than the limit.
    /// Names that are not well-formed UTF-8 are refused: the host could not
    /// hold them as strings, so they cannot be members.
    ///
    /// The name is taken as the bytes the folder listing gives: a host string
    /// made for each of a large folder's entries would cost more than the
    /// whole link.
    bool operator()(std::string_view name) const;

    const ZEB::ZEBString& GetPrefix() const { return m_Prefix; }
    const ZEB::ZEBString& GetExtension() const { return m_Extension; }

protected:
    /// The prefix that `prefixOf` reads from `name`, and the name's extension.
    /// Throws std::logic_error "Failed to initialize VTImportFilter" (the text
    /// of both schemes) when `prefixOf` finds none or either part is empty.
    GroupNameFilter(const ZEB::ZEBString& name, bool (*prefixOf)(ZEB::ZEBString, ZEB::ZEBString&),
                    uint32_t variableLimit);

private:
    ZEB::ZEBString m_Prefix;
    ZEB::ZEBString m_Extension;
    std::string m_PrefixBytes;
    std::string m_ExtensionBytes;
    uint32_t m_PrefixCharacters = 0;
    uint32_t m_ExtensionCharacters = 0;
    uint32_t m_VariableLimit;
};

}  // namespace Grouping
