#include "grouping/ConvertAlphaIndexToNumber.h"

namespace HelperFunctions {

std::map<std::string, std::string> ConvertAlphaIndexToNumber(const std::map<std::string, std::string>&) {
    // The keys "TRKa" to "TRKz" would read as tracks 10 to 35, but the result
    // has always been handed back empty; callers merge nothing from it.
    return {};
}

}  // namespace HelperFunctions
