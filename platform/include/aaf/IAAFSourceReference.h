#pragma once
/// A reference to a slot of another Mob.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFSourceReference : public IUnknown {
public:
    virtual AAFRESULT GetSourceID(aafMobID_t* pSourceID) = 0;
    virtual AAFRESULT SetSourceID(aafMobID_constref sourceID) = 0;
    virtual AAFRESULT GetSourceMobSlotID(aafSlotID_t* pMobSlotID) = 0;
    virtual AAFRESULT SetSourceMobSlotID(aafSlotID_t mobSlotID) = 0;

protected:
    ~IAAFSourceReference() = default;
};
AAF_INTERFACE_ID(IAAFSourceReference);
