#include "TypeDefStringType.h"

#include <cstring>
#include <cwchar>

namespace aafmodel {

TypeDefStringType::TypeDefStringType(Schema& schema, const aafUID_t& id, std::wstring name, TypeDefinition* elementType)
    : TypeDefFace(schema, id, std::move(name), kAAFTypeCatString), m_elementType(elementType) {}

void TypeDefStringType::Store(Value& value, const aafUInt8* chars, aafUInt32 size) {
    if (size % sizeof(aafCharacter) != 0) throw static_cast<int>(AAFRESULT_ILLEGAL_VALUE);
    value.data.assign(chars, chars + size);
    aafCharacter last = L'\x1';
    if (size) std::memcpy(&last, chars + size - sizeof(aafCharacter), sizeof last);
    if (last != L'\0') value.data.resize(size + sizeof(aafCharacter), 0);
}

AAFRESULT TypeDefStringType::Initialize(aafUID_constref id, IAAFTypeDef* pTypeDef, aafCharacter_constptr pTypeName) {
    return Guarded([&] {
        TypeDefinition* element = Borrow<TypeDefinition>(pTypeDef, kInternal_TypeDefinition);
        Require(element);
        if (element->NativeSize() != sizeof(aafCharacter)) throw static_cast<int>(AAFRESULT_BAD_TYPE);
        Define(id, pTypeName);
        m_elementType = element;
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefStringType::GetType(IAAFTypeDef** ppTypeDef) {
    if (!ppTypeDef) return AAFRESULT_NULL_PARAM;
    if (!m_elementType) return AAFRESULT_NOT_INITIALIZED;
    *ppTypeDef = m_elementType->Interface();
    (*ppTypeDef)->AddRef();
    return AAFRESULT_SUCCESS;
}

AAFRESULT TypeDefStringType::GetCount(IAAFPropertyValue* pPropVal, aafUInt32* pCount) {
    return Guarded([&] {
        Require(pCount);
        *pCount = static_cast<aafUInt32>(ValueOf(pPropVal).data.size() / sizeof(aafCharacter));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefStringType::CreateValueFromCString(aafMemPtr_t pInitData, aafUInt32 initDataSize,
                                                    IAAFPropertyValue** ppPropVal) {
    return Guarded([&] {
        Require(pInitData);
        Require(ppPropVal);
        Value value = EmptyValue();
        Store(value, pInitData, initDataSize);
        *ppPropVal = NewValue(std::move(value));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefStringType::SetCString(IAAFPropertyValue* pPropVal, aafMemPtr_t pData, aafUInt32 dataSize) {
    return Guarded([&] {
        Require(pData);
        Store(ValueOf(pPropVal), pData, dataSize);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefStringType::AppendElements(IAAFPropertyValue* pInPropVal, aafMemPtr_t pElements) {
    return Guarded([&] {
        Require(pElements);
        Value& value = ValueOf(pInPropVal);
        std::wstring text(reinterpret_cast<const aafCharacter*>(value.data.data()),
                          value.data.size() / sizeof(aafCharacter));
        text.resize(std::wcslen(text.c_str()));
        text += reinterpret_cast<const aafCharacter*>(pElements);
        Store(value, reinterpret_cast<const aafUInt8*>(text.c_str()),
              static_cast<aafUInt32>((text.size() + 1) * sizeof(aafCharacter)));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefStringType::GetElements(IAAFPropertyValue* pInPropVal, aafMemPtr_t pBuffer, aafUInt32 bufferSize) {
    return Guarded([&] {
        Require(pBuffer);
        const Value& value = ValueOf(pInPropVal);
        if (bufferSize < value.data.size()) throw static_cast<int>(AAFRESULT_SMALLBUF);
        std::memcpy(pBuffer, value.data.data(), value.data.size());
        return AAFRESULT_SUCCESS;
    });
}

}  // namespace aafmodel
