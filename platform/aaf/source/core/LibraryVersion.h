#pragma once
/// The version of this library, as AAFGetLibraryVersion and the headers'
/// reference implementation version report it.
#include "aaf/AAFTypes.h"

namespace aafmodel {

inline constexpr aafProductVersion_t kLibraryVersion = {0, 1, 0, 0, kAAFVersionBeta};

}  // namespace aafmodel
