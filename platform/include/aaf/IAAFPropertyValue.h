#pragma once
/// A typed value, of a property or free standing.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFPropertyValue : public IUnknown {
public:
    virtual AAFRESULT GetType(IAAFTypeDef** ppTypeDef) = 0;
    virtual AAFRESULT IsDefinedType(aafBool* pIsDefined) = 0;

protected:
    ~IAAFPropertyValue() = default;
};
AAF_INTERFACE_ID(IAAFPropertyValue);
