#pragma once
/// Walks the property definitions of a class.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IEnumAAFPropertyDefs : public IUnknown {
public:
    virtual AAFRESULT NextOne(IAAFPropertyDef** ppPropertyDef) = 0;
    virtual AAFRESULT Next(aafUInt32 count, IAAFPropertyDef** ppPropertyDefs, aafUInt32* pFetched) = 0;
    virtual AAFRESULT Skip(aafUInt32 count) = 0;
    virtual AAFRESULT Reset() = 0;
    virtual AAFRESULT Clone(IEnumAAFPropertyDefs** ppEnum) = 0;

protected:
    ~IEnumAAFPropertyDefs() = default;
};
AAF_INTERFACE_ID(IEnumAAFPropertyDefs);
