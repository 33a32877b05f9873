#pragma once
/// A type: its category, which tells the further interface to ask for.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFTypeDef : public IUnknown {
public:
    virtual AAFRESULT GetTypeCategory(eAAFTypeCategory_t* pTid) = 0;
    virtual AAFRESULT RawAccessType(IAAFTypeDef** ppRawTypeDef) = 0;

protected:
    ~IAAFTypeDef() = default;
};
AAF_INTERFACE_ID(IAAFTypeDef);
