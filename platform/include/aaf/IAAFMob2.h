#pragma once
/// A Mob with attributes, usage code and event slots.
#include "aaf/IAAFMob.h"

class IAAFMob2 : public IAAFMob {
public:
    virtual AAFRESULT AppendAttribute(aafCharacter_constptr pName, aafCharacter_constptr pValue) = 0;
    virtual AAFRESULT CountAttributes(aafUInt32* pNumAttributes) = 0;
    virtual AAFRESULT GetAttributes(IEnumAAFTaggedValues** ppEnum) = 0;
    virtual AAFRESULT RemoveAttribute(IAAFTaggedValue* pAttribute) = 0;
    virtual AAFRESULT SetUsageCode(aafUID_constref usageCode) = 0;
    virtual AAFRESULT GetUsageCode(aafUID_t* pUsageCode) = 0;
    virtual AAFRESULT AppendNewStaticSlot(IAAFSegment* pSegment, aafSlotID_t slotID, aafCharacter_constptr pSlotName,
                                          IAAFStaticMobSlot** ppNewSlot) = 0;
    virtual AAFRESULT AppendNewEventSlot(aafRational_t editRate, IAAFSegment* pSegment, aafSlotID_t slotID,
                                         aafCharacter_constptr pSlotName, aafPosition_t origin,
                                         IAAFEventMobSlot** ppNewSlot) = 0;

protected:
    ~IAAFMob2() = default;
};
AAF_INTERFACE_ID(IAAFMob2);
