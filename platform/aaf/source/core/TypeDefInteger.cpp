#include "TypeDefInteger.h"

#include <cstring>

namespace aafmodel {

namespace {
bool ValidSize(aafUInt32 size) { return size == 1 || size == 2 || size == 4 || size == 8; }
}  // namespace

TypeDefInteger::TypeDefInteger(Schema& schema, const aafUID_t& id, std::wstring name, aafUInt8 size, bool isSigned,
                               eAAFTypeCategory_t category)
    : TypeDefFace(schema, id, std::move(name), category), m_size(size), m_signed(isSigned) {}

aafInt64 TypeDefInteger::Read(const Value& value) const {
    if (value.data.size() != m_size) throw static_cast<int>(AAFRESULT_BAD_TYPE);
    aafUInt64 raw = 0;
    std::memcpy(&raw, value.data.data(), m_size);  // little-endian hosts only
    if (m_signed && m_size < 8 && (raw >> (m_size * 8 - 1)) & 1) raw |= ~0ull << (m_size * 8);
    return static_cast<aafInt64>(raw);
}

void TypeDefInteger::Write(Value& value, aafInt64 v) const {
    if (m_size < 8) {
        const aafInt64 lo = m_signed ? -(aafInt64(1) << (m_size * 8 - 1)) : 0;
        const aafInt64 hi = m_signed ? (aafInt64(1) << (m_size * 8 - 1)) - 1 : (aafInt64(1) << (m_size * 8)) - 1;
        if (v < lo || v > hi) throw static_cast<int>(AAFRESULT_ILLEGAL_VALUE);
    }
    value.data.resize(m_size);
    std::memcpy(value.data.data(), &v, m_size);
}

AAFRESULT TypeDefInteger::Initialize(aafUID_constref id, aafUInt8 intSize, aafBool isSigned,
                                     aafCharacter_constptr pTypeName) {
    return Guarded([&] {
        if (!ValidSize(intSize)) throw static_cast<int>(AAFRESULT_ILLEGAL_VALUE);
        Define(id, pTypeName);
        m_size = intSize;
        m_signed = isSigned != kAAFFalse;
        return AAFRESULT_SUCCESS;
    });
}

// Values pass in the type's own width: a narrower or wider buffer is refused.
AAFRESULT TypeDefInteger::CreateValue(aafMemPtr_t pVal, aafUInt32 valSize, IAAFPropertyValue** ppPropVal) {
    return Guarded([&] {
        Require(pVal);
        Require(ppPropVal);
        if (valSize != m_size) throw static_cast<int>(AAFRESULT_ILLEGAL_VALUE);
        Value value = EmptyValue();
        std::memcpy(value.data.data(), pVal, m_size);
        *ppPropVal = NewValue(std::move(value));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefInteger::GetInteger(IAAFPropertyValue* pPropVal, aafMemPtr_t pVal, aafUInt32 valSize) {
    return Guarded([&] {
        Require(pVal);
        Value& value = ValueOf(pPropVal);
        if (valSize != m_size || value.data.size() != m_size) throw static_cast<int>(AAFRESULT_ILLEGAL_VALUE);
        std::memcpy(pVal, value.data.data(), m_size);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefInteger::SetInteger(IAAFPropertyValue* pPropVal, aafMemPtr_t pVal, aafUInt32 valSize) {
    return Guarded([&] {
        Require(pVal);
        Value& value = ValueOf(pPropVal);
        if (valSize != m_size) throw static_cast<int>(AAFRESULT_ILLEGAL_VALUE);
        value.data.assign(pVal, pVal + m_size);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefInteger::GetSize(aafUInt32* pSize) {
    if (!pSize) return AAFRESULT_NULL_PARAM;
    *pSize = m_size;
    return AAFRESULT_SUCCESS;
}

AAFRESULT TypeDefInteger::IsSigned(aafBool* pSigned) {
    if (!pSigned) return AAFRESULT_NULL_PARAM;
    *pSigned = m_signed ? kAAFTrue : kAAFFalse;
    return AAFRESULT_SUCCESS;
}

}  // namespace aafmodel
