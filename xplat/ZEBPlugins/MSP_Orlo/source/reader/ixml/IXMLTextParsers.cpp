#include "reader/ixml/IXMLTextParsers.h"

#include <locale>
#include <sstream>

#include "reader/SplitString.h"
#include "reader/ixml/IXMLElements.h"

namespace Chunks {
namespace IXML {

namespace {

// Setting up a stream costs far more than reading a number with it, so each
// thread reads its numbers through one stream, reset for every text. It reads
// in the classic locale, which is what a new stream got here: nothing sets
// another global one.
std::istream& StreamOver(const std::string& text) {
    thread_local std::istringstream stream = [] {
        std::istringstream made;
        made.imbue(std::locale::classic());
        return made;
    }();
    stream.clear();
    stream.str(text);
    return stream;
}

template <typename T>
bool ReadNumber(const std::string& text, T& value) {
    T read{};
    if (!(StreamOver(text) >> read)) return false;
    value = read;
    return true;
}

template <typename T>
bool IntegerFrom(const ZEB::ZEBString& text, T& value) {
    return !text.IsEmpty() && ReadNumber(UTF8Text(text), value);
}

}  // namespace

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
        int32_t n = 0;
        int32_t d = 0;
        if (!ReadNumber(parts[0], n) || !ReadNumber(parts[1], d)) return false;
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

bool VersionFromString(const ZEB::ZEBString& text, double& version) { return ReadNumber(UTF8Text(text), version); }

bool IntegerFromZEBString(const ZEB::ZEBString& text, uint16_t& value) { return IntegerFrom(text, value); }

bool IntegerFromZEBString(const ZEB::ZEBString& text, uint32_t& value) { return IntegerFrom(text, value); }

void TruncateIXMLString(std::string& text) {
    const size_t last = text.rfind('>');
    if (last != std::string::npos) text.erase(last + 1);
}

}  // namespace IXML
}  // namespace Chunks
