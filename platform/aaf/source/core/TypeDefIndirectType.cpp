#include "TypeDefIndirectType.h"

#include <cstring>

#include "PropertyValue.h"

namespace aafmodel {

TypeDefIndirectType::TypeDefIndirectType(Schema& schema, const aafUID_t& id, std::wstring name)
    : TypeDefFace(schema, id, std::move(name), kAAFTypeCatIndirect) {}

Value TypeDefIndirectType::Wrap(TypeDefinition& actual, const aafUInt8* data, size_t size) {
    if (actual.HoldsObjects() || &actual == this) throw static_cast<int>(AAFRESULT_BAD_TYPE);
    if (actual.NativeSize() != 0 && actual.NativeSize() != size) throw static_cast<int>(AAFRESULT_ILLEGAL_VALUE);
    Value value;
    value.type = this;
    value.actual = &actual;
    value.data.assign(data, data + size);
    return value;
}

AAFRESULT TypeDefIndirectType::CreateValueFromActualValue(IAAFPropertyValue* pActualValue,
                                                          IAAFPropertyValue** ppIndirectPropertyValue) {
    return Guarded([&] {
        Require(ppIndirectPropertyValue);
        PropertyValue* actual = Borrow<PropertyValue>(pActualValue, kInternal_PropertyValue);
        Require(actual);
        const Value& inner = actual->Get();
        *ppIndirectPropertyValue = NewValue(Wrap(*inner.type, inner.data.data(), inner.data.size()));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefIndirectType::CreateValueFromActualData(IAAFTypeDef* pActualType, aafMemPtr_t pInitData,
                                                         aafUInt32 initDataSize,
                                                         IAAFPropertyValue** ppIndirectPropertyValue) {
    return Guarded([&] {
        Require(ppIndirectPropertyValue);
        Require(pInitData || initDataSize == 0);
        TypeDefinition* actual = Borrow<TypeDefinition>(pActualType, kInternal_TypeDefinition);
        Require(actual);
        *ppIndirectPropertyValue = NewValue(Wrap(*actual, pInitData, initDataSize));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefIndirectType::GetActualValue(IAAFPropertyValue* pIndirectPropertyValue,
                                              IAAFPropertyValue** ppActualPropertyValue) {
    return Guarded([&] {
        Require(ppActualPropertyValue);
        const Value& value = ValueOf(pIndirectPropertyValue);
        Require(value.actual, AAFRESULT_PROP_NOT_PRESENT);
        Value inner;
        inner.type = value.actual;
        inner.data = value.data;
        *ppActualPropertyValue = value.actual->NewValue(std::move(inner));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefIndirectType::GetActualSize(IAAFPropertyValue* pIndirectPropertyValue, aafUInt32* pActualSize) {
    return Guarded([&] {
        Require(pActualSize);
        *pActualSize = static_cast<aafUInt32>(ValueOf(pIndirectPropertyValue).data.size());
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefIndirectType::GetActualType(IAAFPropertyValue* pIndirectPropertyValue, IAAFTypeDef** pActualType) {
    return Guarded([&] {
        Require(pActualType);
        const Value& value = ValueOf(pIndirectPropertyValue);
        Require(value.actual, AAFRESULT_PROP_NOT_PRESENT);
        *pActualType = value.actual->Interface();
        (*pActualType)->AddRef();
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefIndirectType::GetActualData(IAAFPropertyValue* pPropVal, aafMemPtr_t pData, aafUInt32 dataSize) {
    return Guarded([&] {
        Require(pData);
        const Value& value = ValueOf(pPropVal);
        if (dataSize < value.data.size()) throw static_cast<int>(AAFRESULT_SMALLBUF);
        if (!value.data.empty()) std::memcpy(pData, value.data.data(), value.data.size());
        return AAFRESULT_SUCCESS;
    });
}

}  // namespace aafmodel
