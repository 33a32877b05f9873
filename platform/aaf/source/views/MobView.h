#pragma once
/// What every Mob does: identity, name, times, slots, comments and attributes.
#include "../core/ViewBase.h"
#include "aaf/IAAFMob2.h"

namespace aafmodel {

class MobView final : public View<IAAFMob2, IAAFMob> {
public:
    using View::View;

    AAFRESULT GetMobID(aafMobID_t* pMobID) override;
    AAFRESULT SetMobID(aafMobID_constref mobID) override;
    AAFRESULT SetName(aafCharacter_constptr pName) override;
    AAFRESULT GetName(aafCharacter* pName, aafUInt32 bufSize) override;
    AAFRESULT GetNameBufLen(aafUInt32* pBufSize) override;
    AAFRESULT CountSlots(aafNumSlots_t* pNumSlots) override;
    AAFRESULT AppendSlot(IAAFMobSlot* pSlot) override;
    AAFRESULT PrependSlot(IAAFMobSlot* pSlot) override;
    AAFRESULT InsertSlotAt(aafUInt32 index, IAAFMobSlot* pSlot) override;
    AAFRESULT RemoveSlotAt(aafUInt32 index) override;
    AAFRESULT GetSlotAt(aafUInt32 index, IAAFMobSlot** ppSlot) override;
    AAFRESULT GetSlots(IEnumAAFMobSlots** ppEnum) override;
    AAFRESULT GetModTime(aafTimeStamp_t* pLastModified) override;
    AAFRESULT SetModTime(aafTimeStamp_constref modTime) override;
    AAFRESULT GetCreateTime(aafTimeStamp_t* pCreationTime) override;
    AAFRESULT SetCreateTime(aafTimeStamp_constref createTime) override;
    AAFRESULT AppendComment(aafCharacter_constptr pCategory, aafCharacter_constptr pComment) override;
    AAFRESULT CountComments(aafUInt32* pNumComments) override;
    AAFRESULT GetComments(IEnumAAFTaggedValues** ppEnum) override;
    AAFRESULT RemoveComment(IAAFTaggedValue* pComment) override;
    AAFRESULT AppendNewTimelineSlot(aafRational_t editRate, IAAFSegment* pSegment, aafSlotID_t slotID,
                                    aafCharacter_constptr pSlotName, aafPosition_t origin,
                                    IAAFTimelineMobSlot** ppNewSlot) override;
    AAFRESULT GetMobInfo(aafTimeStamp_t* pLastModified, aafTimeStamp_t* pCreationTime, aafCharacter* pName,
                         aafInt32 bufSize) override;
    AAFRESULT OffsetToMobTimecode(IAAFSegment* pTcSeg, aafPosition_t* pOffset, aafTimecode_t* pResult) override;
    AAFRESULT LookupSlot(aafSlotID_t slotId, IAAFMobSlot** ppDestSlot) override;
    AAFRESULT ChangeRef(aafMobID_constref oldMobID, aafMobID_constref newMobID) override;
    AAFRESULT CloneExternal(aafDepend_t resolveDependencies, aafIncMedia_t includeMedia, IAAFFile* pDestFile,
                            IAAFMob** ppDestMob) override;
    AAFRESULT Copy(aafCharacter_constptr pDestMobName, IAAFMob** ppDestMob) override;
    AAFRESULT AppendKLVData(IAAFKLVData* pData) override;
    AAFRESULT CountKLVData(aafUInt32* pNumData) override;
    AAFRESULT GetKLVData(IEnumAAFKLVData** ppEnum) override;
    AAFRESULT RemoveKLVData(IAAFKLVData* pData) override;
    AAFRESULT AppendAttribute(aafCharacter_constptr pName, aafCharacter_constptr pValue) override;
    AAFRESULT CountAttributes(aafUInt32* pNumAttributes) override;
    AAFRESULT GetAttributes(IEnumAAFTaggedValues** ppEnum) override;
    AAFRESULT RemoveAttribute(IAAFTaggedValue* pAttribute) override;
    AAFRESULT SetUsageCode(aafUID_constref usageCode) override;
    AAFRESULT GetUsageCode(aafUID_t* pUsageCode) override;
    AAFRESULT AppendNewStaticSlot(IAAFSegment* pSegment, aafSlotID_t slotID, aafCharacter_constptr pSlotName,
                                  IAAFStaticMobSlot** ppNewSlot) override;
    AAFRESULT AppendNewEventSlot(aafRational_t editRate, IAAFSegment* pSegment, aafSlotID_t slotID,
                                 aafCharacter_constptr pSlotName, aafPosition_t origin,
                                 IAAFEventMobSlot** ppNewSlot) override;
};

}  // namespace aafmodel
