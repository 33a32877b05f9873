#pragma once
/// The product identification that every AAF file made by the plug-in carries.
#include "aaf/AAFTypes.h"
#include "tov/tovUID.h"

namespace ZEB {

/// Fills `product`: the version record and the platform text are statics of
/// this function, rewritten at every call; the three texts are the caller's.
/// The record is valid only as long as those texts are.
void GetProductID(_aafProductIdentification_t& product, unsigned short major, unsigned short minor,
                  unsigned short tertiary, unsigned short patchLevel, const wchar_t* company,
                  const wchar_t* productName, const wchar_t* version, _tovUID productID);

}  // namespace ZEB
