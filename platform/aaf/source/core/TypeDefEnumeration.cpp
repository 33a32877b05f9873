#include "TypeDefEnumeration.h"

#include "TypeDefInteger.h"
#include "WideText.h"

namespace aafmodel {

TypeDefEnumeration::TypeDefEnumeration(Schema& schema, const aafUID_t& id, std::wstring name,
                                       TypeDefInteger* elementType, std::vector<Element> elements)
    : TypeDefFace(schema, id, std::move(name), kAAFTypeCatEnum),
      m_elementType(elementType),
      m_elements(std::move(elements)) {}

size_t TypeDefEnumeration::NativeSize() const { return m_elementType ? m_elementType->NativeSize() : 0; }

TypeDefInteger& TypeDefEnumeration::ElementType() const {
    if (!m_elementType) throw static_cast<int>(AAFRESULT_NOT_INITIALIZED);
    return *m_elementType;
}

const std::wstring& TypeDefEnumeration::NameOf(aafInt64 v) const {
    for (const Element& e : m_elements)
        if (e.second == v) return e.first;
    throw static_cast<int>(AAFRESULT_ILLEGAL_VALUE);
}

AAFRESULT TypeDefEnumeration::Initialize(aafUID_constref id, IAAFTypeDef* pType, aafInt64* pElementValues,
                                         aafString_t* pElementNames, aafUInt32 numElems,
                                         aafCharacter_constptr pTypeName) {
    return Guarded([&] {
        Require(pElementValues);
        Require(pElementNames);
        auto* type = dynamic_cast<TypeDefInteger*>(Borrow<TypeDefinition>(pType, kInternal_TypeDefinition));
        if (!type) throw static_cast<int>(AAFRESULT_BAD_TYPE);
        std::vector<Element> elements;
        for (aafUInt32 i = 0; i < numElems; ++i) elements.emplace_back(WideArg(pElementNames[i]), pElementValues[i]);
        Define(id, pTypeName);
        m_elementType = type;
        m_elements = std::move(elements);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefEnumeration::CreateValueFromName(aafCharacter_constptr Name, IAAFPropertyValue** ppPropVal) {
    return Guarded([&] {
        Require(ppPropVal);
        const std::wstring name = WideArg(Name);
        for (const Element& e : m_elements) {
            if (e.first != name) continue;
            Value value = EmptyValue();
            ElementType().Write(value, e.second);
            value.type = this;
            *ppPropVal = NewValue(std::move(value));
            return AAFRESULT_SUCCESS;
        }
        throw static_cast<int>(AAFRESULT_ILLEGAL_VALUE);
    });
}

AAFRESULT TypeDefEnumeration::GetElementType(IAAFTypeDef** ppTypeDef) {
    return Guarded([&] {
        Require(ppTypeDef);
        *ppTypeDef = ElementType().Interface();
        (*ppTypeDef)->AddRef();
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefEnumeration::GetElementValue(aafUInt32 index, aafInt64* pOutValue) {
    if (!pOutValue) return AAFRESULT_NULL_PARAM;
    if (index >= m_elements.size()) return AAFRESULT_BADINDEX;
    *pOutValue = m_elements[index].second;
    return AAFRESULT_SUCCESS;
}

AAFRESULT TypeDefEnumeration::GetElementName(aafUInt32 index, aafCharacter* pOutValue, aafUInt32 bufSize) {
    return Guarded([&] {
        if (index >= m_elements.size()) throw static_cast<int>(AAFRESULT_BADINDEX);
        CopyWide(m_elements[index].first, pOutValue, bufSize);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefEnumeration::GetElementNameBufLen(aafUInt32 index, aafUInt32* pLen) {
    if (!pLen) return AAFRESULT_NULL_PARAM;
    if (index >= m_elements.size()) return AAFRESULT_BADINDEX;
    *pLen = WideBufLen(m_elements[index].first);
    return AAFRESULT_SUCCESS;
}

AAFRESULT TypeDefEnumeration::CountElements(aafUInt32* pCount) {
    if (!pCount) return AAFRESULT_NULL_PARAM;
    *pCount = static_cast<aafUInt32>(m_elements.size());
    return AAFRESULT_SUCCESS;
}

AAFRESULT TypeDefEnumeration::GetNameFromValue(IAAFPropertyValue* pValue, aafCharacter* pName, aafUInt32 bufSize) {
    return Guarded([&] {
        CopyWide(NameOf(ElementType().Read(ValueOf(pValue))), pName, bufSize);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefEnumeration::GetNameBufLenFromValue(IAAFPropertyValue* pValue, aafUInt32* pLen) {
    return Guarded([&] {
        Require(pLen);
        *pLen = WideBufLen(NameOf(ElementType().Read(ValueOf(pValue))));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefEnumeration::GetNameFromInteger(aafInt64 value, aafCharacter* pName, aafUInt32 bufSize) {
    return Guarded([&] {
        CopyWide(NameOf(value), pName, bufSize);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefEnumeration::GetNameBufLenFromInteger(aafInt64 value, aafUInt32* pLen) {
    return Guarded([&] {
        Require(pLen);
        *pLen = WideBufLen(NameOf(value));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefEnumeration::GetIntegerValue(IAAFPropertyValue* pPropValIn, aafInt64* pValueOut) {
    return Guarded([&] {
        Require(pValueOut);
        *pValueOut = ElementType().Read(ValueOf(pPropValIn));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefEnumeration::SetIntegerValue(IAAFPropertyValue* pPropValToSet, aafInt64 valueIn) {
    return Guarded([&] {
        Value& value = ValueOf(pPropValToSet);
        NameOf(valueIn);  // only named values are values of the enumeration
        ElementType().Write(value, valueIn);
        return AAFRESULT_SUCCESS;
    });
}

// The in-memory size is the element type's; no other size is kept.
AAFRESULT TypeDefEnumeration::RegisterSize(aafUInt32) { return AAFRESULT_NOT_IMPLEMENTED; }

}  // namespace aafmodel
