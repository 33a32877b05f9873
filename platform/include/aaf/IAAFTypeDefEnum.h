#pragma once
/// An enumeration: named values over an integer type.
#include "aaf/IAAFTypeDef.h"

class IAAFTypeDefEnum : public IAAFTypeDef {
public:
    virtual AAFRESULT Initialize(aafUID_constref id, IAAFTypeDef* pType, aafInt64* pElementValues,
                                 aafString_t* pElementNames, aafUInt32 numElems, aafCharacter_constptr pTypeName) = 0;
    virtual AAFRESULT CreateValueFromName(aafCharacter_constptr Name, IAAFPropertyValue** ppPropVal) = 0;
    virtual AAFRESULT GetElementType(IAAFTypeDef** ppTypeDef) = 0;
    virtual AAFRESULT GetElementValue(aafUInt32 index, aafInt64* pOutValue) = 0;
    virtual AAFRESULT GetElementName(aafUInt32 index, aafCharacter* pOutValue, aafUInt32 bufSize) = 0;
    virtual AAFRESULT GetElementNameBufLen(aafUInt32 index, aafUInt32* pLen) = 0;
    virtual AAFRESULT CountElements(aafUInt32* pCount) = 0;
    virtual AAFRESULT GetNameFromValue(IAAFPropertyValue* pValue, aafCharacter* pName, aafUInt32 bufSize) = 0;
    virtual AAFRESULT GetNameBufLenFromValue(IAAFPropertyValue* pValue, aafUInt32* pLen) = 0;
    virtual AAFRESULT GetNameFromInteger(aafInt64 value, aafCharacter* pName, aafUInt32 bufSize) = 0;
    virtual AAFRESULT GetNameBufLenFromInteger(aafInt64 value, aafUInt32* pLen) = 0;
    virtual AAFRESULT GetIntegerValue(IAAFPropertyValue* pPropValIn, aafInt64* pValueOut) = 0;
    virtual AAFRESULT SetIntegerValue(IAAFPropertyValue* pPropValToSet, aafInt64 valueIn) = 0;
    virtual AAFRESULT RegisterSize(aafUInt32 enumSize) = 0;

protected:
    ~IAAFTypeDefEnum() = default;
};
AAF_INTERFACE_ID(IAAFTypeDefEnum);
