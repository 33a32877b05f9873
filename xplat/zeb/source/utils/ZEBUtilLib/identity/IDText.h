#pragma once
/// The hexadecimal text forms that every written form of bytes, GUIDs and Mob
/// IDs is made of, in the case the reader expects.
#include <cstddef>
#include <string>

#include "aaf/AAFTypes.h"

namespace ZEB {

enum class HexCase { Lower, Upper };

/// Two digits a byte, in order.
std::string HexText(const unsigned char* bytes, size_t count, HexCase letters);
/// "XXXXXXXX-XXXX-XXXX-XXXX-XXXXXXXXXXXX": Data1, Data2 and Data3 as numbers,
/// most significant digit first, then Data4's bytes.
std::string GUIDText(const _aafUID_t& id, HexCase letters);
/// 64 digits without separators: the label bytes, length and instance bytes,
/// then the material as in GUIDText. GetMobIDFromString reads them back into
/// the same ID.
std::string MobIDDigits(const _aafMobID_t& id, HexCase letters);

}  // namespace ZEB
