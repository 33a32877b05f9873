#pragma once
/// Walks the components of a sequence.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IEnumAAFComponents : public IUnknown {
public:
    virtual AAFRESULT NextOne(IAAFComponent** ppComponent) = 0;
    virtual AAFRESULT Next(aafUInt32 count, IAAFComponent** ppComponents, aafUInt32* pFetched) = 0;
    virtual AAFRESULT Skip(aafUInt32 count) = 0;
    virtual AAFRESULT Reset() = 0;
    virtual AAFRESULT Clone(IEnumAAFComponents** ppEnum) = 0;

protected:
    ~IEnumAAFComponents() = default;
};
AAF_INTERFACE_ID(IEnumAAFComponents);
