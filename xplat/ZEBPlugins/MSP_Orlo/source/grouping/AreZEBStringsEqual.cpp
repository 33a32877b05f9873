#include "grouping/AreZEBStringsEqual.h"

namespace HelperFunctions {

bool AreZEBStringsEqual(const ZEB::ZEBString& a, const ZEB::ZEBString& b, int flags) {
    if (a.IsEmpty() || b.IsEmpty()) return false;
    ZEB::ZEBString utf8A(a), utf8B(b);
    utf8A.ConvertTo(kTOVUnicodeUTF8);
    utf8B.ConvertTo(kTOVUnicodeUTF8);
    return utf8A.Compare(utf8B.InArg(), flags) == 0;
}

}  // namespace HelperFunctions
