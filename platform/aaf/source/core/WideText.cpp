#include "WideText.h"

#include <cstring>

#include "Guard.h"

namespace aafmodel {

aafUInt32 WideBufLen(const std::wstring& text) {
    return static_cast<aafUInt32>((text.size() + 1) * sizeof(aafCharacter));
}

void CopyWide(const std::wstring& text, aafCharacter* buffer, aafUInt32 bufSize) {
    Require(buffer);
    if (bufSize < WideBufLen(text)) throw static_cast<int>(AAFRESULT_SMALLBUF);
    std::memcpy(buffer, text.c_str(), WideBufLen(text));
}

std::wstring WideArg(aafCharacter_constptr text) {
    Require(text);
    return std::wstring(text);
}

}  // namespace aafmodel
