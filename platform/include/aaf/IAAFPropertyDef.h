#pragma once
/// A property: its type and whether it may be absent.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFPropertyDef : public IUnknown {
public:
    virtual AAFRESULT GetTypeDef(IAAFTypeDef** ppTypeDef) = 0;
    virtual AAFRESULT GetName(aafCharacter* pName, aafUInt32 bufSize) = 0;
    virtual AAFRESULT GetNameBufLen(aafUInt32* pBufSize) = 0;
    virtual AAFRESULT GetIsOptional(aafBool* pIsOptional) = 0;
    virtual AAFRESULT GetIsUniqueIdentifier(aafBool* pIsUniqueIdentifier) = 0;

protected:
    ~IAAFPropertyDef() = default;
};
AAF_INTERFACE_ID(IAAFPropertyDef);
