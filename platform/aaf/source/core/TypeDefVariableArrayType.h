#pragma once
/// Arrays of any length of one element type. Arrays of plain data hold the
/// elements' bytes one after another; arrays of strong references (the
/// strong reference vectors of the model) hold the objects.
#include "TypeDefFace.h"
#include "aaf/IAAFTypeDefVariableArray.h"

namespace aafmodel {

class TypeDefVariableArrayType final : public TypeDefFace<IAAFTypeDefVariableArray> {
public:
    TypeDefVariableArrayType(Schema& schema, const aafUID_t& id, std::wstring name, TypeDefinition& elementType);

    bool HoldsObjects() const override { return m_element.HoldsObjects(); }
    TypeDefinition& Element() const { return m_element; }

    AAFRESULT GetType(IAAFTypeDef** ppTypeDef) override;
    AAFRESULT GetCount(IAAFPropertyValue* pPropVal, aafUInt32* pCount) override;
    AAFRESULT AppendElement(IAAFPropertyValue* pInPropVal, IAAFPropertyValue* pMemberPropVal) override;
    AAFRESULT CreateEmptyValue(IAAFPropertyValue** ppPropVal) override;
    AAFRESULT CreateValueFromValues(IAAFPropertyValue** pElementValues, aafUInt32 numElements,
                                    IAAFPropertyValue** ppPropVal) override;
    AAFRESULT CreateValueFromCArray(aafMemPtr_t pInitData, aafUInt32 initDataSize,
                                    IAAFPropertyValue** ppPropVal) override;
    AAFRESULT GetElementValue(IAAFPropertyValue* pInPropVal, aafUInt32 index,
                              IAAFPropertyValue** ppOutPropVal) override;
    AAFRESULT GetCArray(IAAFPropertyValue* pPropVal, aafMemPtr_t pData, aafUInt32 dataSize) override;
    AAFRESULT SetElementValue(IAAFPropertyValue* pPropVal, aafUInt32 index, IAAFPropertyValue* pMemberPropVal) override;
    AAFRESULT SetCArray(IAAFPropertyValue* pPropVal, aafMemPtr_t pData, aafUInt32 dataSize) override;
    AAFRESULT GetElements(IAAFPropertyValue* pPropVal, IEnumAAFPropertyValues** ppEnum) override;

private:
    size_t Count(const Value& value) const;
    /// The element at `index` as a free value.
    Value ElementAt(const Value& value, size_t index) const;
    /// Puts an element value at `index` (appending when it equals the count).
    void Put(Value& array, size_t index, IAAFPropertyValue* pElement) const;
    /// Throws AAFRESULT_BAD_TYPE for arrays of objects, which have no C array form.
    void RequireData() const;

    TypeDefinition& m_element;
};

}  // namespace aafmodel
