#pragma once
/// What a Master Mob adds: slots made from source references.
#include "../core/ViewBase.h"
#include "aaf/IAAFMasterMob.h"

namespace aafmodel {

class MasterMobView final : public View<IAAFMasterMob> {
public:
    using View::View;

    AAFRESULT Initialize() override;
    AAFRESULT AddMasterSlot(IAAFDataDef* pDataDef, aafSlotID_t sourceSlotID, IAAFSourceMob* pSourceMob,
                            aafSlotID_t masterSlotID, aafCharacter_constptr pSlotName) override;
    AAFRESULT GetTapeName(aafUInt32 masterSlotID, aafCharacter* pTapeName, aafUInt32 bufSize) override;
    AAFRESULT GetTapeNameBufLen(aafUInt32 masterSlotID, aafUInt32* pLen) override;
    AAFRESULT GetNumRepresentations(aafSlotID_t slotID, aafNumSlots_t* pNumReps) override;
    AAFRESULT GetRepresentation(aafSlotID_t slotID, aafUInt32 index, IAAFSegment** ppSourceClip) override;
    AAFRESULT GetCriteriaSegment(aafSlotID_t slotID, aafMediaCriteria_t* pCriteria, IAAFSegment** ppSegment) override;
    AAFRESULT AppendPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot, IAAFDataDef* pEssenceKind,
                                  aafSourceRef_t ref, aafLength_t srcRefLength) override;
    AAFRESULT NewPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot, IAAFDataDef* pEssenceKind,
                               aafSourceRef_t ref, aafLength_t srcRefLength) override;
    AAFRESULT CreateEssence(aafSlotID_t masterSlotID, IAAFDataDef* pMediaKind, aafUID_constref codecID,
                            aafRational_t editRate, aafRational_t samplerate, aafCompressEnable_t Enable,
                            IAAFLocator* destination, aafUID_constref fileFormat, IAAFEssenceAccess** access) override;
    AAFRESULT CreateMultiEssence(aafUID_constref codecID, aafUInt16 arrayElemCount, aafmMultiCreate_t* mediaArray,
                                 aafCompressEnable_t Enable, IAAFLocator* destination, aafUID_constref fileFormat,
                                 IAAFEssenceMultiAccess** access) override;
    AAFRESULT OpenEssence(aafSlotID_t slotID, aafMediaCriteria_t* mediaCrit, aafMediaOpenMode_t openMode,
                          aafCompressEnable_t compEnable, IAAFEssenceAccess** access) override;
    AAFRESULT OpenMultiEssence(aafSlotID_t slotID, aafMediaCriteria_t* mediaCrit, aafMediaOpenMode_t openMode,
                               aafCompressEnable_t compEnable, IAAFEssenceMultiAccess** access) override;
    AAFRESULT CountChannels(aafSlotID_t slotID, aafMediaCriteria_t* mediaCrit, IAAFDataDef* pMediaKind,
                            aafUInt16* numCh) override;
};

}  // namespace aafmodel
