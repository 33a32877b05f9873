#pragma once
/// A track of a Mob: id, name, physical number, segment.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFMobSlot : public IUnknown {
public:
    virtual AAFRESULT GetSegment(IAAFSegment** ppResult) = 0;
    virtual AAFRESULT SetName(aafCharacter_constptr pName) = 0;
    virtual AAFRESULT GetName(aafCharacter* pName, aafUInt32 bufSize) = 0;
    virtual AAFRESULT GetNameBufLen(aafUInt32* pBufSize) = 0;
    virtual AAFRESULT GetPhysicalNum(aafUInt32* pResult) = 0;
    virtual AAFRESULT GetDataDef(IAAFDataDef** ppResult) = 0;
    virtual AAFRESULT GetSlotID(aafSlotID_t* pResult) = 0;
    virtual AAFRESULT SetSegment(IAAFSegment* pSegment) = 0;
    virtual AAFRESULT SetPhysicalNum(aafUInt32 physicalNum) = 0;
    virtual AAFRESULT SetSlotID(aafSlotID_t value) = 0;

protected:
    ~IAAFMobSlot() = default;
};
AAF_INTERFACE_ID(IAAFMobSlot);
