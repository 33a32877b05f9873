#include "reader/IXMLTextParsers.h"

#include <cstdint>

#include "reader/IXMLElements.h"
#include "reader/SplitString.h"

namespace Chunks {
namespace IXML {

std::string UTF8Text(const ZEB::ZEBString& text) {
    if (text.IsEmpty()) return std::string();
    return reinterpret_cast<const char*>(text.GetUTF8String());
}

bool BoolFromString(const ZEB::ZEBString& text, bool& value) {
    const std::string word = UTF8Text(text);
    if (word == IXMLElements::ELEM_VALUE_TRUE) {
        value = true;
        return true;
    }
    if (word == IXMLElements::ELEM_VALUE_FALSE) {
        value = false;
        return true;
    }
    return false;
}

bool DropFrameFromString(const ZEB::ZEBString& text, bool& drop) {
    const std::string word = UTF8Text(text);
    if (word == IXMLElements::TIMECODE_FLAG_VALUE_NONDROP) {
        drop = false;
        return true;
    }
    if (word == IXMLElements::TIMECODE_FLAG_VALUE_DROP) {
        drop = true;
        return true;
    }
    return false;
}

bool FrameRateFromString(const ZEB::ZEBString& text, _aafRational_t& rate) {
    try {
        const std::vector<std::string> parts = HelperFunctions::SplitString(UTF8Text(text), '/');
        if (parts.size() != 2 || parts[0].empty() || parts[1].empty()) return false;
        std::istringstream numerator(parts[0]);
        std::istringstream denominator(parts[1]);
        int32_t n = 0;
        int32_t d = 0;
        if (!(numerator >> n) || !(denominator >> d)) return false;
        rate.numerator = n;
        rate.denominator = d;
        return true;
    } catch (...) {
        return false;
    }
}

bool SamplesFromString(const ZEB::ZEBString& hi, const ZEB::ZEBString& lo, unsigned long long& samples) {
    uint32_t high = 0;
    uint32_t low = 0;
    if (!IntegerFromZEBString(hi, high) || !IntegerFromZEBString(lo, low)) return false;
    samples = (static_cast<unsigned long long>(high) << 32) + low;
    return true;
}

void TruncateIXMLString(std::string& text) {
    const size_t last = text.rfind('>');
    if (last != std::string::npos) text.erase(last + 1);
}

}  // namespace IXML
}  // namespace Chunks
