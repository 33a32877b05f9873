#pragma once
/// The indirect type: a value that carries its actual type beside its data,
/// as tagged values hold their comments and attributes.
#include "TypeDefFace.h"
#include "aaf/IAAFTypeDefIndirect.h"

namespace aafmodel {

class TypeDefIndirectType final : public TypeDefFace<IAAFTypeDefIndirect> {
public:
    TypeDefIndirectType(Schema& schema, const aafUID_t& id, std::wstring name);

    /// An indirect value of `actual` holding `data`; throws AAFRESULT_BAD_TYPE
    /// for types whose values are objects, and AAFRESULT_ILLEGAL_VALUE for a
    /// size that a fixed-size type cannot have.
    Value Wrap(TypeDefinition& actual, const aafUInt8* data, size_t size);

    AAFRESULT CreateValueFromActualValue(IAAFPropertyValue* pActualValue,
                                         IAAFPropertyValue** ppIndirectPropertyValue) override;
    AAFRESULT CreateValueFromActualData(IAAFTypeDef* pActualType, aafMemPtr_t pInitData, aafUInt32 initDataSize,
                                        IAAFPropertyValue** ppIndirectPropertyValue) override;
    AAFRESULT GetActualValue(IAAFPropertyValue* pIndirectPropertyValue,
                             IAAFPropertyValue** ppActualPropertyValue) override;
    AAFRESULT GetActualSize(IAAFPropertyValue* pIndirectPropertyValue, aafUInt32* pActualSize) override;
    AAFRESULT GetActualType(IAAFPropertyValue* pIndirectPropertyValue, IAAFTypeDef** pActualType) override;
    AAFRESULT GetActualData(IAAFPropertyValue* pPropVal, aafMemPtr_t pData, aafUInt32 dataSize) override;
};

}  // namespace aafmodel
