#include "identity/StandardizePath.h"

#include <algorithm>

namespace ZEB {
namespace AAFUtils {

void StandardizePath(ZEBString& path) {
    path.ConvertTo(kTOVUnicodeWCHAR);
    // A wide string hands out its own storage, so this writes into `path`.
    wchar_t* text = path.GetWCHARString();
    std::replace(text, text + path.GetNumCharacters(), L'\\', L'/');
}

}  // namespace AAFUtils
}  // namespace ZEB
