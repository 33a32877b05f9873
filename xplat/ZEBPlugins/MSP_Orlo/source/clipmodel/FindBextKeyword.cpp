#include "clipmodel/FindBextKeyword.h"

namespace OrloReader {

bool FindBextKeyword(const Chunks::BEXT::BEXTChunk* bext, const char* key, std::string& value) {
    if (bext == nullptr) return false;
    const auto& keywords = bext->GetConstParsedDescriptionField();
    const auto found = keywords.find(key);
    if (found == keywords.end()) return false;
    value = found->second;
    return true;
}

}  // namespace OrloReader
