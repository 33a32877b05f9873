#pragma once
/// A clip model text (UTF-8 bytes) as the wide string that AAF takes, on its
/// way through a ZEBString: text that is not UTF-8 throws the string's result.
#include <string>

namespace ZEB {
namespace Impl {

std::wstring WideThroughString(const std::string& utf8);

}  // namespace Impl
}  // namespace ZEB
