#pragma once
/// An empty stretch of a sequence.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFFiller : public IUnknown {
public:
    virtual AAFRESULT Initialize(IAAFDataDef* pDataDef, aafLength_t length) = 0;

protected:
    ~IAAFFiller() = default;
};
AAF_INTERFACE_ID(IAAFFiller);
