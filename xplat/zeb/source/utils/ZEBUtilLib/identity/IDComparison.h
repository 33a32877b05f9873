#pragma once
/// Equality and null tests of UIDs and Mob IDs.
#include "aaf/AAFTypes.h"

namespace ZEB {
namespace AAFUtils {

/// The all-zero identifiers.
inline constexpr _aafUID_t UID_NULL = {0, 0, 0, {0, 0, 0, 0, 0, 0, 0, 0}};
inline constexpr _aafMobID_t MOBID_NULL = {{0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0}, 0, 0, 0, 0, UID_NULL};

/// Field-wise equality.
bool IsEqualUID(const _aafUID_t& a, const _aafUID_t& b);
bool IsEqualMobID(const _aafMobID_t& a, const _aafMobID_t& b);
/// Equal to UID_NULL, MOBID_NULL.
bool IsNullUID(const _aafUID_t& id);
bool IsNullMobID(const _aafMobID_t& id);

}  // namespace AAFUtils
}  // namespace ZEB
