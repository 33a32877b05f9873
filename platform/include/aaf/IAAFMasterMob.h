#pragma once
/// The Mob that the editor sees; its slots lead to Source Mobs.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFMasterMob : public IUnknown {
public:
    virtual AAFRESULT Initialize() = 0;
    virtual AAFRESULT AddMasterSlot(IAAFDataDef* pDataDef, aafSlotID_t sourceSlotID, IAAFSourceMob* pSourceMob,
                                    aafSlotID_t masterSlotID, aafCharacter_constptr pSlotName) = 0;
    virtual AAFRESULT GetTapeName(aafUInt32 masterSlotID, aafCharacter* pTapeName, aafUInt32 bufSize) = 0;
    virtual AAFRESULT GetTapeNameBufLen(aafUInt32 masterSlotID, aafUInt32* pLen) = 0;
    virtual AAFRESULT GetNumRepresentations(aafSlotID_t slotID, aafNumSlots_t* pNumReps) = 0;
    virtual AAFRESULT GetRepresentation(aafSlotID_t slotID, aafUInt32 index, IAAFSegment** ppSourceClip) = 0;
    virtual AAFRESULT GetCriteriaSegment(aafSlotID_t slotID, aafMediaCriteria_t* pCriteria,
                                         IAAFSegment** ppSegment) = 0;
    virtual AAFRESULT AppendPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot, IAAFDataDef* pEssenceKind,
                                          aafSourceRef_t ref, aafLength_t srcRefLength) = 0;
    virtual AAFRESULT NewPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot, IAAFDataDef* pEssenceKind,
                                       aafSourceRef_t ref, aafLength_t srcRefLength) = 0;
    virtual AAFRESULT CreateEssence(aafSlotID_t masterSlotID, IAAFDataDef* pMediaKind, aafUID_constref codecID,
                                    aafRational_t editRate, aafRational_t samplerate, aafCompressEnable_t Enable,
                                    IAAFLocator* destination, aafUID_constref fileFormat,
                                    IAAFEssenceAccess** access) = 0;
    virtual AAFRESULT CreateMultiEssence(aafUID_constref codecID, aafUInt16 arrayElemCount,
                                         aafmMultiCreate_t* mediaArray, aafCompressEnable_t Enable,
                                         IAAFLocator* destination, aafUID_constref fileFormat,
                                         IAAFEssenceMultiAccess** access) = 0;
    virtual AAFRESULT OpenEssence(aafSlotID_t slotID, aafMediaCriteria_t* mediaCrit, aafMediaOpenMode_t openMode,
                                  aafCompressEnable_t compEnable, IAAFEssenceAccess** access) = 0;
    virtual AAFRESULT OpenMultiEssence(aafSlotID_t slotID, aafMediaCriteria_t* mediaCrit, aafMediaOpenMode_t openMode,
                                       aafCompressEnable_t compEnable, IAAFEssenceMultiAccess** access) = 0;
    virtual AAFRESULT CountChannels(aafSlotID_t slotID, aafMediaCriteria_t* mediaCrit, IAAFDataDef* pMediaKind,
                                    aafUInt16* numCh) = 0;

protected:
    ~IAAFMasterMob() = default;
};
AAF_INTERFACE_ID(IAAFMasterMob);
