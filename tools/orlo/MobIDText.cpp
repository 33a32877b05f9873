#include "MobIDText.h"

#include <cstdio>

std::string MobIDText(const _aafMobID_t& id) {
    char text[65];
    char* at = text;
    for (aafUInt8 byte : id.SMPTELabel) at += std::snprintf(at, 3, "%02X", byte);
    at += std::snprintf(at, 9, "%02X%02X%02X%02X", id.length, id.instanceHigh, id.instanceMid, id.instanceLow);
    at += std::snprintf(at, 17, "%08X%04X%04X", id.material.Data1, id.material.Data2, id.material.Data3);
    for (aafUInt8 byte : id.material.Data4) at += std::snprintf(at, 3, "%02X", byte);
    return std::string(text, at);
}
