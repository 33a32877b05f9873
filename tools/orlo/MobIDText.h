#pragma once
/// A Mob ID as 64 upper-case hex digits.
#include <string>

#include "aaf/AAFTypes.h"

/// The label bytes, length and instance bytes, then the material's Data1,
/// Data2 and Data3 as numbers (most significant digit first) and Data4's
/// bytes: the text that ZEB::GetMobIDFromString reads back into the same ID.
std::string MobIDText(const _aafMobID_t& id);
