#include "aafbuilder/WideThroughString.h"

#include "strings/UTFConversions.h"
#include "strings/ZEBString.h"

namespace ZEB {
namespace Impl {

std::wstring WideThroughString(const std::string& utf8) {
    const ZEBString text(reinterpret_cast<const unsigned char*>(utf8.c_str()));
    std::wstring wide;
    wFromUTF8(reinterpret_cast<const char*>(text.GetUTF8String()), wide);
    return wide;
}

}  // namespace Impl
}  // namespace ZEB
