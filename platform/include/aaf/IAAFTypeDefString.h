#pragma once
/// A string of characters.
#include "aaf/IAAFTypeDef.h"

class IAAFTypeDefString : public IAAFTypeDef {
public:
    virtual AAFRESULT Initialize(aafUID_constref id, IAAFTypeDef* pTypeDef, aafCharacter_constptr pTypeName) = 0;
    virtual AAFRESULT GetType(IAAFTypeDef** ppTypeDef) = 0;
    virtual AAFRESULT GetCount(IAAFPropertyValue* pPropVal, aafUInt32* pCount) = 0;
    virtual AAFRESULT CreateValueFromCString(aafMemPtr_t pInitData, aafUInt32 initDataSize,
                                             IAAFPropertyValue** ppPropVal) = 0;
    virtual AAFRESULT SetCString(IAAFPropertyValue* pPropVal, aafMemPtr_t pData, aafUInt32 dataSize) = 0;
    virtual AAFRESULT AppendElements(IAAFPropertyValue* pInPropVal, aafMemPtr_t pElements) = 0;
    virtual AAFRESULT GetElements(IAAFPropertyValue* pInPropVal, aafMemPtr_t pBuffer, aafUInt32 bufferSize) = 0;

protected:
    ~IAAFTypeDefString() = default;
};
AAF_INTERFACE_ID(IAAFTypeDefString);
