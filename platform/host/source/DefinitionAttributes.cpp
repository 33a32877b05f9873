#include "tov/host/DefinitionAttributes.h"

#include <cstring>
#include <cwchar>

#include "tov/TOVDefinitionIDs.h"

TOVRESULT DefinitionAttributes::Set(const _tovUID& attribute, const _tovUID& type, const void* value, int size) {
    if (size == -1 && type == TOVTypeID_UnicodeString) {
        if (!value) return TOV_E_INVALIDARG;
        size = static_cast<int>((std::wcslen(static_cast<const wchar_t*>(value)) + 1) * sizeof(wchar_t));
    }
    if (size < 0 || (!value && size != 0)) return TOV_E_INVALIDARG;
    const auto* bytes = static_cast<const unsigned char*>(value);
    m_Values[attribute] = Value{type, std::vector<unsigned char>(bytes, bytes + size)};
    return TOV_OK;
}

TOVRESULT DefinitionAttributes::Get(const _tovUID& attribute, const _tovUID& type, void* out, unsigned int size) const {
    const auto found = m_Values.find(attribute);
    if (found == m_Values.end()) return ZEB_E_NOTFOUND;
    const Value& value = found->second;
    if (value.type != type || !out || size < value.bytes.size()) return TOV_E_INVALIDARG;
    if (!value.bytes.empty()) std::memcpy(out, value.bytes.data(), value.bytes.size());
    return TOV_OK;
}
