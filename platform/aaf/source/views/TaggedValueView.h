#pragma once
/// A tagged value: a name and a value of any type.
#include "../core/ViewBase.h"
#include "aaf/IAAFTaggedValue.h"

namespace aafmodel {

class TaggedValueView final : public View<IAAFTaggedValue> {
public:
    using View::View;

    AAFRESULT Initialize(aafCharacter_constptr pName, IAAFTypeDef* pTypeDef, aafUInt32 valueSize,
                         aafDataBuffer_t pValue) override;
    AAFRESULT GetName(aafCharacter* pName, aafUInt32 bufSize) override;
    AAFRESULT GetNameBufLen(aafUInt32* pLen) override;
    AAFRESULT GetTypeDefinition(IAAFTypeDef** ppTypeDef) override;
    AAFRESULT GetValue(aafUInt32 valueSize, aafDataBuffer_t pValue, aafUInt32* bytesRead) override;
    AAFRESULT GetValueBufLen(aafUInt32* pLen) override;
    AAFRESULT SetValue(aafUInt32 valueSize, aafDataBuffer_t pValue) override;
};

}  // namespace aafmodel
