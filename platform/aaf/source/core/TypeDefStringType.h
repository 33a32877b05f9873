#pragma once
/// Strings of characters. A value holds its characters and the terminating
/// null, so its count of elements includes the null.
#include "TypeDefFace.h"
#include "aaf/IAAFTypeDefString.h"

namespace aafmodel {

class TypeDefStringType final : public TypeDefFace<IAAFTypeDefString> {
public:
    TypeDefStringType(Schema& schema, const aafUID_t& id, std::wstring name, TypeDefinition* elementType);

    using MetaDefinitionBase::Initialize;
    AAFRESULT Initialize(aafUID_constref id, IAAFTypeDef* pTypeDef, aafCharacter_constptr pTypeName) override;
    AAFRESULT GetType(IAAFTypeDef** ppTypeDef) override;
    AAFRESULT GetCount(IAAFPropertyValue* pPropVal, aafUInt32* pCount) override;
    AAFRESULT CreateValueFromCString(aafMemPtr_t pInitData, aafUInt32 initDataSize,
                                     IAAFPropertyValue** ppPropVal) override;
    AAFRESULT SetCString(IAAFPropertyValue* pPropVal, aafMemPtr_t pData, aafUInt32 dataSize) override;
    AAFRESULT AppendElements(IAAFPropertyValue* pInPropVal, aafMemPtr_t pElements) override;
    AAFRESULT GetElements(IAAFPropertyValue* pInPropVal, aafMemPtr_t pBuffer, aafUInt32 bufferSize) override;

private:
    /// Stores `size` bytes of characters, adding the null when it is missing.
    static void Store(Value& value, const aafUInt8* chars, aafUInt32 size);

    TypeDefinition* m_elementType;
};

}  // namespace aafmodel
