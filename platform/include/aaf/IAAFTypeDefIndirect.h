#pragma once
/// A value that carries its own type.
#include "aaf/IAAFTypeDef.h"

class IAAFTypeDefIndirect : public IAAFTypeDef {
public:
    virtual AAFRESULT CreateValueFromActualValue(IAAFPropertyValue* pActualValue,
                                                 IAAFPropertyValue** ppIndirectPropertyValue) = 0;
    virtual AAFRESULT CreateValueFromActualData(IAAFTypeDef* pActualType, aafMemPtr_t pInitData, aafUInt32 initDataSize,
                                                IAAFPropertyValue** ppIndirectPropertyValue) = 0;
    virtual AAFRESULT GetActualValue(IAAFPropertyValue* pIndirectPropertyValue,
                                     IAAFPropertyValue** ppActualPropertyValue) = 0;
    virtual AAFRESULT GetActualSize(IAAFPropertyValue* pIndirectPropertyValue, aafUInt32* pActualSize) = 0;
    virtual AAFRESULT GetActualType(IAAFPropertyValue* pIndirectPropertyValue, IAAFTypeDef** pActualType) = 0;
    virtual AAFRESULT GetActualData(IAAFPropertyValue* pPropVal, aafMemPtr_t pData, aafUInt32 dataSize) = 0;

protected:
    ~IAAFTypeDefIndirect() = default;
};
AAF_INTERFACE_ID(IAAFTypeDefIndirect);
