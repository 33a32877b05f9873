#pragma once
/// One present property of an object: its definition and value.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFProperty : public IUnknown {
public:
    virtual AAFRESULT GetDefinition(IAAFPropertyDef** ppPropDef) = 0;
    virtual AAFRESULT GetValue(IAAFPropertyValue** ppValue) = 0;

protected:
    ~IAAFProperty() = default;
};
AAF_INTERFACE_ID(IAAFProperty);
