#pragma once
/// What every component does: data definition, length, comments and attributes.
#include "../core/ViewBase.h"
#include "aaf/IAAFComponent2.h"

namespace aafmodel {

class ComponentView final : public View<IAAFComponent2, IAAFComponent> {
public:
    using View::View;

    AAFRESULT SetLength(aafLength_constref length) override;
    AAFRESULT GetLength(aafLength_t* pLength) override;
    AAFRESULT SetDataDef(IAAFDataDef* pDataDef) override;
    AAFRESULT GetDataDef(IAAFDataDef** ppDatadef) override;
    AAFRESULT AppendKLVData(IAAFKLVData* pData) override;
    AAFRESULT CountKLVData(aafUInt32* pNumData) override;
    AAFRESULT GetKLVData(IEnumAAFKLVData** ppEnum) override;
    AAFRESULT RemoveKLVData(IAAFKLVData* pData) override;
    AAFRESULT AppendComment(aafCharacter_constptr pName, aafCharacter_constptr pValue) override;
    AAFRESULT CountComments(aafUInt32* pNumComments) override;
    AAFRESULT GetComments(IEnumAAFTaggedValues** ppEnum) override;
    AAFRESULT RemoveComment(IAAFTaggedValue* pComment) override;
    AAFRESULT AppendAttribute(aafCharacter_constptr pName, aafCharacter_constptr pValue) override;
    AAFRESULT CountAttributes(aafUInt32* pNumAttributes) override;
    AAFRESULT GetAttributes(IEnumAAFTaggedValues** ppEnum) override;
    AAFRESULT RemoveAttribute(IAAFTaggedValue* pAttribute) override;
};

}  // namespace aafmodel
