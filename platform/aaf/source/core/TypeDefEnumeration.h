#pragma once
/// Enumerations: named values over an integer type.
#include <string>
#include <utility>
#include <vector>

#include "TypeDefFace.h"
#include "aaf/IAAFTypeDefEnum.h"

namespace aafmodel {

class TypeDefInteger;

class TypeDefEnumeration final : public TypeDefFace<IAAFTypeDefEnum> {
public:
    using Element = std::pair<std::wstring, aafInt64>;

    /// `elementType` null makes an undefined enumeration for CreateMetaInstance.
    TypeDefEnumeration(Schema& schema, const aafUID_t& id, std::wstring name, TypeDefInteger* elementType,
                       std::vector<Element> elements);

    size_t NativeSize() const override;
    size_t Alignment() const override { return NativeSize(); }

    using MetaDefinitionBase::Initialize;
    AAFRESULT Initialize(aafUID_constref id, IAAFTypeDef* pType, aafInt64* pElementValues, aafString_t* pElementNames,
                         aafUInt32 numElems, aafCharacter_constptr pTypeName) override;
    AAFRESULT CreateValueFromName(aafCharacter_constptr Name, IAAFPropertyValue** ppPropVal) override;
    AAFRESULT GetElementType(IAAFTypeDef** ppTypeDef) override;
    AAFRESULT GetElementValue(aafUInt32 index, aafInt64* pOutValue) override;
    AAFRESULT GetElementName(aafUInt32 index, aafCharacter* pOutValue, aafUInt32 bufSize) override;
    AAFRESULT GetElementNameBufLen(aafUInt32 index, aafUInt32* pLen) override;
    AAFRESULT CountElements(aafUInt32* pCount) override;
    AAFRESULT GetNameFromValue(IAAFPropertyValue* pValue, aafCharacter* pName, aafUInt32 bufSize) override;
    AAFRESULT GetNameBufLenFromValue(IAAFPropertyValue* pValue, aafUInt32* pLen) override;
    AAFRESULT GetNameFromInteger(aafInt64 value, aafCharacter* pName, aafUInt32 bufSize) override;
    AAFRESULT GetNameBufLenFromInteger(aafInt64 value, aafUInt32* pLen) override;
    AAFRESULT GetIntegerValue(IAAFPropertyValue* pPropValIn, aafInt64* pValueOut) override;
    AAFRESULT SetIntegerValue(IAAFPropertyValue* pPropValToSet, aafInt64 valueIn) override;
    AAFRESULT RegisterSize(aafUInt32 enumSize) override;

private:
    /// The element name of `v`; throws AAFRESULT_ILLEGAL_VALUE for a value with no name.
    const std::wstring& NameOf(aafInt64 v) const;
    TypeDefInteger& ElementType() const;

    TypeDefInteger* m_elementType;
    std::vector<Element> m_elements;
};

}  // namespace aafmodel
