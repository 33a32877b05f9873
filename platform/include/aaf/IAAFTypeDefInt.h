#pragma once
/// An integer type of 1, 2, 4 or 8 bytes, signed or not.
#include "aaf/IAAFTypeDef.h"

class IAAFTypeDefInt : public IAAFTypeDef {
public:
    virtual AAFRESULT Initialize(aafUID_constref id, aafUInt8 intSize, aafBool isSigned,
                                 aafCharacter_constptr pTypeName) = 0;
    virtual AAFRESULT CreateValue(aafMemPtr_t pVal, aafUInt32 valSize, IAAFPropertyValue** ppPropVal) = 0;
    virtual AAFRESULT GetInteger(IAAFPropertyValue* pPropVal, aafMemPtr_t pVal, aafUInt32 valSize) = 0;
    virtual AAFRESULT SetInteger(IAAFPropertyValue* pPropVal, aafMemPtr_t pVal, aafUInt32 valSize) = 0;
    virtual AAFRESULT GetSize(aafUInt32* pSize) = 0;
    virtual AAFRESULT IsSigned(aafBool* pSigned) = 0;

protected:
    ~IAAFTypeDefInt() = default;
};
AAF_INTERFACE_ID(IAAFTypeDefInt);
