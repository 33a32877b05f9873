#include "grouping/GetFileExtension.h"

#include <string>

#include "grouping/UTF8Name.h"

namespace HelperFunctions {

ZEB::ZEBString GetFileExtension(const ZEB::ZEBString& name) {
    const std::string text = Grouping::UTF8Name(name);
    const size_t dot = text.rfind('.');
    return Grouping::NameText(dot == std::string::npos ? std::string() : text.substr(dot));
}

}  // namespace HelperFunctions
