#pragma once
/// An array of any length of one element type; strong reference vectors are of this kind.
#include "aaf/IAAFTypeDef.h"

class IAAFTypeDefVariableArray : public IAAFTypeDef {
public:
    virtual AAFRESULT GetType(IAAFTypeDef** ppTypeDef) = 0;
    virtual AAFRESULT GetCount(IAAFPropertyValue* pPropVal, aafUInt32* pCount) = 0;
    virtual AAFRESULT AppendElement(IAAFPropertyValue* pInPropVal, IAAFPropertyValue* pMemberPropVal) = 0;
    virtual AAFRESULT CreateEmptyValue(IAAFPropertyValue** ppPropVal) = 0;
    virtual AAFRESULT CreateValueFromValues(IAAFPropertyValue** pElementValues, aafUInt32 numElements,
                                            IAAFPropertyValue** ppPropVal) = 0;
    virtual AAFRESULT CreateValueFromCArray(aafMemPtr_t pInitData, aafUInt32 initDataSize,
                                            IAAFPropertyValue** ppPropVal) = 0;
    virtual AAFRESULT GetElementValue(IAAFPropertyValue* pInPropVal, aafUInt32 index,
                                      IAAFPropertyValue** ppOutPropVal) = 0;
    virtual AAFRESULT GetCArray(IAAFPropertyValue* pPropVal, aafMemPtr_t pData, aafUInt32 dataSize) = 0;
    virtual AAFRESULT SetElementValue(IAAFPropertyValue* pPropVal, aafUInt32 index,
                                      IAAFPropertyValue* pMemberPropVal) = 0;
    virtual AAFRESULT SetCArray(IAAFPropertyValue* pPropVal, aafMemPtr_t pData, aafUInt32 dataSize) = 0;
    virtual AAFRESULT GetElements(IAAFPropertyValue* pPropVal, IEnumAAFPropertyValues** ppEnum) = 0;

protected:
    ~IAAFTypeDefVariableArray() = default;
};
AAF_INTERFACE_ID(IAAFTypeDefVariableArray);
