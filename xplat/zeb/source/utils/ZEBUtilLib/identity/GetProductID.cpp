#include "identity/GetProductID.h"

#include <cstring>

namespace ZEB {

static_assert(sizeof(_tovUID) == sizeof(_aafUID_t), "the framework's identifiers are AAF UIDs");

void GetProductID(_aafProductIdentification_t& product, unsigned short major, unsigned short minor,
                  unsigned short tertiary, unsigned short patchLevel, const wchar_t* company,
                  const wchar_t* productName, const wchar_t* version, _tovUID productID) {
    // Every caller writes the same values, so the statics need no lock. The
    // platform text is the file format's record of the original platform and
    // stays as it is on every system.
    static aafProductVersion_t product_version;
    static aafCharacter platform[] = L"MacOS X";
    product_version = {major, minor, tertiary, patchLevel, kAAFVersionUnknown};
    product.productVersion = &product_version;
    // The record's texts are not const in the published layout; nothing writes through them.
    product.companyName = const_cast<aafCharacter*>(company);
    product.productName = const_cast<aafCharacter*>(productName);
    product.productVersionString = const_cast<aafCharacter*>(version);
    std::memcpy(&product.productID, &productID, sizeof product.productID);
    product.platform = platform;
}

}  // namespace ZEB
