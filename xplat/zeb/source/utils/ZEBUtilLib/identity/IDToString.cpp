#include "identity/IDToString.h"

#include "identity/IDText.h"

namespace ZEB {
namespace AAFUtils {

ZEBString MobIDtoString(const _aafMobID_t& id) {
    const std::string digits = MobIDDigits(id, HexCase::Upper);
    const std::string text = digits.substr(0, 24) + "-" + digits.substr(24, 2) + "-" + digits.substr(26, 6) + "-{" +
                             GUIDText(id.material, HexCase::Upper) + "}";
    return ZEBString(reinterpret_cast<const unsigned char*>(text.c_str()));
}

ZEBString UIDtoString(const _aafUID_t& id) {
    const std::string text = "{" + GUIDText(id, HexCase::Upper) + "}";
    return ZEBString(reinterpret_cast<const unsigned char*>(text.c_str()));
}

}  // namespace AAFUtils
}  // namespace ZEB
