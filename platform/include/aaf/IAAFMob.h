#pragma once
/// A Mob: identity, name, times, slots and comments.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFMob : public IUnknown {
public:
    virtual AAFRESULT GetMobID(aafMobID_t* pMobID) = 0;
    virtual AAFRESULT SetMobID(aafMobID_constref mobID) = 0;
    virtual AAFRESULT SetName(aafCharacter_constptr pName) = 0;
    virtual AAFRESULT GetName(aafCharacter* pName, aafUInt32 bufSize) = 0;
    virtual AAFRESULT GetNameBufLen(aafUInt32* pBufSize) = 0;
    virtual AAFRESULT CountSlots(aafNumSlots_t* pNumSlots) = 0;
    virtual AAFRESULT AppendSlot(IAAFMobSlot* pSlot) = 0;
    virtual AAFRESULT PrependSlot(IAAFMobSlot* pSlot) = 0;
    virtual AAFRESULT InsertSlotAt(aafUInt32 index, IAAFMobSlot* pSlot) = 0;
    virtual AAFRESULT RemoveSlotAt(aafUInt32 index) = 0;
    virtual AAFRESULT GetSlotAt(aafUInt32 index, IAAFMobSlot** ppSlot) = 0;
    virtual AAFRESULT GetSlots(IEnumAAFMobSlots** ppEnum) = 0;
    virtual AAFRESULT GetModTime(aafTimeStamp_t* pLastModified) = 0;
    virtual AAFRESULT SetModTime(aafTimeStamp_constref modTime) = 0;
    virtual AAFRESULT GetCreateTime(aafTimeStamp_t* pCreationTime) = 0;
    virtual AAFRESULT SetCreateTime(aafTimeStamp_constref createTime) = 0;
    virtual AAFRESULT AppendComment(aafCharacter_constptr pCategory, aafCharacter_constptr pComment) = 0;
    virtual AAFRESULT CountComments(aafUInt32* pNumComments) = 0;
    virtual AAFRESULT GetComments(IEnumAAFTaggedValues** ppEnum) = 0;
    virtual AAFRESULT RemoveComment(IAAFTaggedValue* pComment) = 0;
    virtual AAFRESULT AppendNewTimelineSlot(aafRational_t editRate, IAAFSegment* pSegment, aafSlotID_t slotID,
                                            aafCharacter_constptr pSlotName, aafPosition_t origin,
                                            IAAFTimelineMobSlot** ppNewSlot) = 0;
    virtual AAFRESULT GetMobInfo(aafTimeStamp_t* pLastModified, aafTimeStamp_t* pCreationTime, aafCharacter* pName,
                                 aafInt32 bufSize) = 0;
    virtual AAFRESULT OffsetToMobTimecode(IAAFSegment* pTcSeg, aafPosition_t* pOffset, aafTimecode_t* pResult) = 0;
    virtual AAFRESULT LookupSlot(aafSlotID_t slotId, IAAFMobSlot** ppDestSlot) = 0;
    virtual AAFRESULT ChangeRef(aafMobID_constref oldMobID, aafMobID_constref newMobID) = 0;
    virtual AAFRESULT CloneExternal(aafDepend_t resolveDependencies, aafIncMedia_t includeMedia, IAAFFile* pDestFile,
                                    IAAFMob** ppDestMob) = 0;
    virtual AAFRESULT Copy(aafCharacter_constptr pDestMobName, IAAFMob** ppDestMob) = 0;
    virtual AAFRESULT AppendKLVData(IAAFKLVData* pData) = 0;
    virtual AAFRESULT CountKLVData(aafUInt32* pNumData) = 0;
    virtual AAFRESULT GetKLVData(IEnumAAFKLVData** ppEnum) = 0;
    virtual AAFRESULT RemoveKLVData(IAAFKLVData* pData) = 0;

protected:
    ~IAAFMob() = default;
};
AAF_INTERFACE_ID(IAAFMob);
