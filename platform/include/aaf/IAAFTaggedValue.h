#pragma once
/// A name with a value of any type: comments and attributes.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFTaggedValue : public IUnknown {
public:
    virtual AAFRESULT Initialize(aafCharacter_constptr pName, IAAFTypeDef* pTypeDef, aafUInt32 valueSize,
                                 aafDataBuffer_t pValue) = 0;
    virtual AAFRESULT GetName(aafCharacter* pName, aafUInt32 bufSize) = 0;
    virtual AAFRESULT GetNameBufLen(aafUInt32* pLen) = 0;
    virtual AAFRESULT GetTypeDefinition(IAAFTypeDef** ppTypeDef) = 0;
    virtual AAFRESULT GetValue(aafUInt32 valueSize, aafDataBuffer_t pValue, aafUInt32* bytesRead) = 0;
    virtual AAFRESULT GetValueBufLen(aafUInt32* pLen) = 0;
    virtual AAFRESULT SetValue(aafUInt32 valueSize, aafDataBuffer_t pValue) = 0;

protected:
    ~IAAFTaggedValue() = default;
};
AAF_INTERFACE_ID(IAAFTaggedValue);
