#include "identity/GetMobIDFromString.h"

#include <cstdio>
#include <string>

namespace ZEB {
namespace {

// The conversions read at fixed places; a place past the end of a short text
// reads the empty text, so nothing beyond the terminator is touched.
class FixedPlaces {
public:
    explicit FixedPlaces(const char* text) : m_Text(text) {}
    const char* At(std::size_t place) const { return m_Text.c_str() + (place < m_Text.size() ? place : m_Text.size()); }

private:
    std::string m_Text;
};

// Each target starts from its current value, so a failed conversion leaves it
// as it was.
void ReadByte(const FixedPlaces& text, std::size_t place, aafUInt8& target) {
    unsigned int value = target;
    std::sscanf(text.At(place), "%02x", &value);
    target = static_cast<aafUInt8>(value);
}

}  // namespace

TOVRESULT GetMobIDFromString(const char* text, _aafMobID_t* out) {
    if (!out) return TOV_E_INVALIDARG;
    const FixedPlaces places(text);
    for (std::size_t i = 0; i < 12; ++i) ReadByte(places, i * 2, out->SMPTELabel[i]);

    unsigned int length = out->length, high = out->instanceHigh, mid = out->instanceMid, low = out->instanceLow;
    std::sscanf(places.At(24), "%02x%02x%02x%02x", &length, &high, &mid, &low);
    out->length = static_cast<aafUInt8>(length);
    out->instanceHigh = static_cast<aafUInt8>(high);
    out->instanceMid = static_cast<aafUInt8>(mid);
    out->instanceLow = static_cast<aafUInt8>(low);

    unsigned int data1 = out->material.Data1, data2 = out->material.Data2, data3 = out->material.Data3;
    std::sscanf(places.At(32), "%08x%04x%04x", &data1, &data2, &data3);
    out->material.Data1 = data1;
    out->material.Data2 = static_cast<aafUInt16>(data2);
    out->material.Data3 = static_cast<aafUInt16>(data3);

    for (std::size_t i = 0; i < 6; ++i) ReadByte(places, 48 + i * 2, out->material.Data4[i]);
    unsigned int byte6 = out->material.Data4[6], byte7 = out->material.Data4[7];
    std::sscanf(places.At(60), "%02x%02x", &byte6, &byte7);
    out->material.Data4[6] = static_cast<aafUInt8>(byte6);
    out->material.Data4[7] = static_cast<aafUInt8>(byte7);
    return TOV_OK;
}

}  // namespace ZEB
