#pragma once
/// The typed attribute store behind every definition of the host.
#include <map>
#include <vector>

#include "tov/TOVResult.h"
#include "tov/tovUID.h"

class DefinitionAttributes {
public:
    /// Copies the value; a TOVTypeID_UnicodeString of size -1 is measured up
    /// to its terminator and stored with it. Other negative sizes, and a null
    /// value with a non-zero size, are TOV_E_INVALIDARG.
    TOVRESULT Set(const _tovUID& attribute, const _tovUID& type, const void* value, int size);
    /// ZEB_E_NOTFOUND for an unknown attribute; TOV_E_INVALIDARG for another
    /// type or a buffer smaller than the value.
    TOVRESULT Get(const _tovUID& attribute, const _tovUID& type, void* out, unsigned int size) const;

private:
    struct Value {
        _tovUID type;
        std::vector<unsigned char> bytes;
    };
    std::map<_tovUID, Value> m_Values;
};
