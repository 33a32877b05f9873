#include "identity/IDText.h"

namespace ZEB {

namespace {

const char* Digits(HexCase letters) { return letters == HexCase::Upper ? "0123456789ABCDEF" : "0123456789abcdef"; }

void AppendNumber(std::string& out, uint32_t value, int digitCount, HexCase letters) {
    const char* digits = Digits(letters);
    for (int shift = (digitCount - 1) * 4; shift >= 0; shift -= 4) out += digits[(value >> shift) & 0x0F];
}

std::string UIDDigits(const _aafUID_t& id, HexCase letters) {
    std::string out;
    AppendNumber(out, id.Data1, 8, letters);
    AppendNumber(out, id.Data2, 4, letters);
    AppendNumber(out, id.Data3, 4, letters);
    return out + HexText(id.Data4, sizeof id.Data4, letters);
}

}  // namespace

std::string HexText(const unsigned char* bytes, size_t count, HexCase letters) {
    const char* digits = Digits(letters);
    std::string out;
    out.reserve(count * 2);
    for (size_t i = 0; i < count; ++i) {
        out += digits[bytes[i] >> 4];
        out += digits[bytes[i] & 0x0F];
    }
    return out;
}

std::string GUIDText(const _aafUID_t& id, HexCase letters) {
    std::string text = UIDDigits(id, letters);
    for (int at : {20, 16, 12, 8}) text.insert(static_cast<size_t>(at), 1, '-');
    return text;
}

std::string MobIDDigits(const _aafMobID_t& id, HexCase letters) {
    const unsigned char lengthAndInstance[] = {id.length, id.instanceHigh, id.instanceMid, id.instanceLow};
    return HexText(id.SMPTELabel, sizeof id.SMPTELabel, letters) +
           HexText(lengthAndInstance, sizeof lengthAndInstance, letters) + UIDDigits(id.material, letters);
}

}  // namespace ZEB
