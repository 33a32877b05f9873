#pragma once
/// Where essence can be found.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFLocator : public IUnknown {
public:
    virtual AAFRESULT SetPath(aafCharacter_constptr pPath) = 0;
    virtual AAFRESULT GetPath(aafCharacter* pPath, aafUInt32 bufSize) = 0;
    virtual AAFRESULT GetPathBufLen(aafUInt32* pBufSize) = 0;

protected:
    ~IAAFLocator() = default;
};
AAF_INTERFACE_ID(IAAFLocator);
