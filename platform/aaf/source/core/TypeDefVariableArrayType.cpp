#include "TypeDefVariableArrayType.h"

#include <cstring>

#include "Enumerator.h"
#include "ModelObject.h"
#include "aaf/IAAFPropertyValue.h"
#include "aaf/IEnumAAFPropertyValues.h"

namespace aafmodel {

TypeDefVariableArrayType::TypeDefVariableArrayType(Schema& schema, const aafUID_t& id, std::wstring name,
                                                   TypeDefinition& elementType)
    : TypeDefFace(schema, id, std::move(name), kAAFTypeCatVariableArray), m_element(elementType) {}

size_t TypeDefVariableArrayType::Count(const Value& value) const {
    if (HoldsObjects()) return value.objects.size();
    return value.data.size() / m_element.NativeSize();
}

Value TypeDefVariableArrayType::ElementAt(const Value& value, size_t index) const {
    if (index >= Count(value)) throw static_cast<int>(AAFRESULT_BADINDEX);
    Value element = m_element.EmptyValue();
    if (HoldsObjects())
        element.objects.push_back(value.objects[index]);
    else
        std::memcpy(element.data.data(), value.data.data() + index * m_element.NativeSize(), m_element.NativeSize());
    return element;
}

void TypeDefVariableArrayType::Put(Value& array, size_t index, IAAFPropertyValue* pElement) const {
    const Value& element = m_element.ValueOf(pElement);
    const size_t count = Count(array);
    if (index > count) throw static_cast<int>(AAFRESULT_BADINDEX);
    if (HoldsObjects()) {
        if (element.objects.empty()) throw static_cast<int>(AAFRESULT_PROP_NOT_PRESENT);
        ModelObject& object = *element.objects.front();
        if (index < count && array.objects[index].get() == &object) return;
        ModelObject::AttachThrough(array, object);
        if (index == count) {
            array.objects.emplace_back(&object);
        } else {
            ModelObject::DetachThrough(array, *array.objects[index]);
            array.objects[index] = RefPtr<ModelObject>(&object);
        }
        return;
    }
    const size_t size = m_element.NativeSize();
    if (index == count) array.data.resize(array.data.size() + size);
    std::memcpy(array.data.data() + index * size, element.data.data(), size);
}

void TypeDefVariableArrayType::RequireData() const {
    if (HoldsObjects() || m_element.NativeSize() == 0) throw static_cast<int>(AAFRESULT_BAD_TYPE);
}

AAFRESULT TypeDefVariableArrayType::GetType(IAAFTypeDef** ppTypeDef) {
    if (!ppTypeDef) return AAFRESULT_NULL_PARAM;
    *ppTypeDef = m_element.Interface();
    (*ppTypeDef)->AddRef();
    return AAFRESULT_SUCCESS;
}

AAFRESULT TypeDefVariableArrayType::GetCount(IAAFPropertyValue* pPropVal, aafUInt32* pCount) {
    return Guarded([&] {
        Require(pCount);
        *pCount = static_cast<aafUInt32>(Count(ValueOf(pPropVal)));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefVariableArrayType::AppendElement(IAAFPropertyValue* pInPropVal, IAAFPropertyValue* pMemberPropVal) {
    return Guarded([&] {
        Value& array = ValueOf(pInPropVal);
        Put(array, Count(array), pMemberPropVal);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefVariableArrayType::CreateEmptyValue(IAAFPropertyValue** ppPropVal) {
    return Guarded([&] {
        Require(ppPropVal);
        *ppPropVal = NewValue(EmptyValue());
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefVariableArrayType::CreateValueFromValues(IAAFPropertyValue** pElementValues, aafUInt32 numElements,
                                                          IAAFPropertyValue** ppPropVal) {
    return Guarded([&] {
        Require(pElementValues || numElements == 0);
        Require(ppPropVal);
        Value array = EmptyValue();
        for (aafUInt32 i = 0; i < numElements; ++i) Put(array, i, pElementValues[i]);
        *ppPropVal = NewValue(std::move(array));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefVariableArrayType::CreateValueFromCArray(aafMemPtr_t pInitData, aafUInt32 initDataSize,
                                                          IAAFPropertyValue** ppPropVal) {
    return Guarded([&] {
        Require(pInitData || initDataSize == 0);
        Require(ppPropVal);
        RequireData();
        if (initDataSize % m_element.NativeSize() != 0) throw static_cast<int>(AAFRESULT_ILLEGAL_VALUE);
        Value array = EmptyValue();
        array.data.assign(pInitData, pInitData + initDataSize);
        *ppPropVal = NewValue(std::move(array));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefVariableArrayType::GetElementValue(IAAFPropertyValue* pInPropVal, aafUInt32 index,
                                                    IAAFPropertyValue** ppOutPropVal) {
    return Guarded([&] {
        Require(ppOutPropVal);
        *ppOutPropVal = m_element.NewValue(ElementAt(ValueOf(pInPropVal), index));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefVariableArrayType::GetCArray(IAAFPropertyValue* pPropVal, aafMemPtr_t pData, aafUInt32 dataSize) {
    return Guarded([&] {
        Require(pData);
        RequireData();
        const Value& array = ValueOf(pPropVal);
        if (dataSize < array.data.size()) throw static_cast<int>(AAFRESULT_SMALLBUF);
        if (!array.data.empty()) std::memcpy(pData, array.data.data(), array.data.size());
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefVariableArrayType::SetElementValue(IAAFPropertyValue* pPropVal, aafUInt32 index,
                                                    IAAFPropertyValue* pMemberPropVal) {
    return Guarded([&] {
        Value& array = ValueOf(pPropVal);
        if (index >= Count(array)) throw static_cast<int>(AAFRESULT_BADINDEX);
        Put(array, index, pMemberPropVal);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefVariableArrayType::SetCArray(IAAFPropertyValue* pPropVal, aafMemPtr_t pData, aafUInt32 dataSize) {
    return Guarded([&] {
        Require(pData || dataSize == 0);
        RequireData();
        Value& array = ValueOf(pPropVal);
        if (dataSize % m_element.NativeSize() != 0) throw static_cast<int>(AAFRESULT_ILLEGAL_VALUE);
        array.data.assign(pData, pData + dataSize);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefVariableArrayType::GetElements(IAAFPropertyValue* pPropVal, IEnumAAFPropertyValues** ppEnum) {
    return Guarded([&] {
        Require(ppEnum);
        const Value& array = ValueOf(pPropVal);
        std::vector<RefPtr<IAAFPropertyValue>> elements;
        for (size_t i = 0; i < Count(array); ++i)
            elements.push_back(RefPtr<IAAFPropertyValue>::Adopt(m_element.NewValue(ElementAt(array, i))));
        *ppEnum = new Enumerator<IEnumAAFPropertyValues, IAAFPropertyValue>(std::move(elements));
        (*ppEnum)->AddRef();
        return AAFRESULT_SUCCESS;
    });
}

}  // namespace aafmodel
