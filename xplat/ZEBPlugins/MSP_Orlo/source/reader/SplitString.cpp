#include "reader/SplitString.h"

namespace HelperFunctions {

std::vector<std::string> SplitString(const std::string& text, char delimiter) {
    std::vector<std::string> pieces;
    size_t begin = 0;
    for (size_t at = text.find(delimiter); at != std::string::npos; at = text.find(delimiter, begin)) {
        pieces.push_back(text.substr(begin, at - begin));
        begin = at + 1;
    }
    pieces.push_back(text.substr(begin));
    return pieces;
}

}  // namespace HelperFunctions
