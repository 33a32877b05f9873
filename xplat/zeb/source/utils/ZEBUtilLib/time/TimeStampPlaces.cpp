#include "time/TimeStampPlaces.h"

#include <cstdlib>

namespace ZEB {
namespace {

int NumberAt(const std::string& text, std::size_t place, std::size_t length) {
    return std::atoi(text.substr(place, length).c_str());
}

}  // namespace

void ReadTimeStampPlaces(const std::string& text, _aafTimeStamp_t& out) {
    out.date.year = static_cast<aafInt16>(NumberAt(text, 0, 4));
    out.date.month = static_cast<aafUInt8>(NumberAt(text, 5, 2));
    out.date.day = static_cast<aafUInt8>(NumberAt(text, 8, 2));
    out.time.hour = static_cast<aafUInt8>(NumberAt(text, 11, 2));
    out.time.minute = static_cast<aafUInt8>(NumberAt(text, 14, 2));
    out.time.second = static_cast<aafUInt8>(NumberAt(text, 17, 2));
    out.time.fraction = 0;
}

}  // namespace ZEB
