#pragma once
/// Where a descriptor's essence lies: a network locator holding the file URL
/// of a path.
#include "aaf/AAF.h"
#include "strings/ZEBString.h"
#include "tov/TOVResult.h"

namespace ZEB {
namespace Impl {

/// Appends a network locator with the URL of `path` to `descriptor`. Returns 0
/// or a result code (TOV_E_INVALIDARG for an empty path); never throws.
TOVRESULT AddLocator(const ZEBString& path, IAAFDictionary* dictionary, IAAFEssenceDescriptor* descriptor);

}  // namespace Impl
}  // namespace ZEB
