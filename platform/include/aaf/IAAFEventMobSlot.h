#pragma once
/// A slot of events at an edit rate.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFEventMobSlot : public IUnknown {
public:
    virtual AAFRESULT GetEditRate(aafRational_t* pEditRate) = 0;
    virtual AAFRESULT SetEditRate(aafRational_t* pEditRate) = 0;

protected:
    ~IAAFEventMobSlot() = default;
};
AAF_INTERFACE_ID(IAAFEventMobSlot);
