#pragma once
/// The text forms of a Mob ID and a UID, in upper-case hexadecimal.
#include "aaf/AAFTypes.h"
#include "strings/ZEBString.h"

namespace ZEB {
namespace AAFUtils {

/// Label, length, instance, then the material in braces as a GUID; for
/// example "060A2B340101010101010F00-13-000000-{...}". A UTF-8 string; needs
/// the library started.
ZEBString MobIDtoString(const _aafMobID_t& id);
/// "{XXXXXXXX-XXXX-XXXX-XXXX-XXXXXXXXXXXX}". A UTF-8 string; needs the library started.
ZEBString UIDtoString(const _aafUID_t& id);

}  // namespace AAFUtils
}  // namespace ZEB
