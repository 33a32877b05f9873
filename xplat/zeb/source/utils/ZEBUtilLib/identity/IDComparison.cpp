#include "identity/IDComparison.h"

#include <algorithm>

namespace ZEB {
namespace AAFUtils {

bool IsEqualUID(const _aafUID_t& a, const _aafUID_t& b) {
    return a.Data1 == b.Data1 && a.Data2 == b.Data2 && a.Data3 == b.Data3 && std::equal(a.Data4, a.Data4 + 8, b.Data4);
}

bool IsEqualMobID(const _aafMobID_t& a, const _aafMobID_t& b) {
    return std::equal(a.SMPTELabel, a.SMPTELabel + 12, b.SMPTELabel) && a.length == b.length &&
           a.instanceHigh == b.instanceHigh && a.instanceMid == b.instanceMid && a.instanceLow == b.instanceLow &&
           IsEqualUID(a.material, b.material);
}

bool IsNullUID(const _aafUID_t& id) { return IsEqualUID(id, UID_NULL); }

bool IsNullMobID(const _aafMobID_t& id) { return IsEqualMobID(id, MOBID_NULL); }

}  // namespace AAFUtils
}  // namespace ZEB
