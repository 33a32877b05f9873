#include "identity/IDToString.h"

#include <cstdio>

namespace ZEB {
namespace AAFUtils {

ZEBString MobIDtoString(const _aafMobID_t& id) {
    char text[100];
    const aafUInt8* label = id.SMPTELabel;
    const _aafUID_t& m = id.material;
    std::snprintf(text, sizeof text,
                  "%02X%02X%02X%02X%02X%02X%02X%02X%02X%02X%02X%02X-%02X-%02X%02X%02X-"
                  "{%08X-%04X-%04X-%02X%02X-%02X%02X%02X%02X%02X%02X}",
                  label[0], label[1], label[2], label[3], label[4], label[5], label[6], label[7], label[8], label[9],
                  label[10], label[11], id.length, id.instanceHigh, id.instanceMid, id.instanceLow, m.Data1, m.Data2,
                  m.Data3, m.Data4[0], m.Data4[1], m.Data4[2], m.Data4[3], m.Data4[4], m.Data4[5], m.Data4[6],
                  m.Data4[7]);
    return ZEBString(reinterpret_cast<const unsigned char*>(text));
}

ZEBString UIDtoString(const _aafUID_t& id) {
    char text[40];
    std::snprintf(text, sizeof text, "{%08X-%04X-%04X-%02X%02X-%02X%02X%02X%02X%02X%02X}", id.Data1, id.Data2, id.Data3,
                  id.Data4[0], id.Data4[1], id.Data4[2], id.Data4[3], id.Data4[4], id.Data4[5], id.Data4[6],
                  id.Data4[7]);
    return ZEBString(reinterpret_cast<const unsigned char*>(text));
}

}  // namespace AAFUtils
}  // namespace ZEB
