#pragma once
/// A slot whose segment runs along a timeline at an edit rate.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFTimelineMobSlot : public IUnknown {
public:
    virtual AAFRESULT Initialize() = 0;
    virtual AAFRESULT GetEditRate(aafRational_t* pEditRate) = 0;
    virtual AAFRESULT SetEditRate(aafRational_constref editRate) = 0;
    virtual AAFRESULT GetOrigin(aafPosition_t* pOrigin) = 0;
    virtual AAFRESULT SetOrigin(aafPosition_t origin) = 0;

protected:
    ~IAAFTimelineMobSlot() = default;
};
AAF_INTERFACE_ID(IAAFTimelineMobSlot);
