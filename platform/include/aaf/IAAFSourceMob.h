#pragma once
/// A Mob that describes a source: a file, a tape, an import.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFSourceMob : public IUnknown {
public:
    virtual AAFRESULT Initialize() = 0;
    virtual AAFRESULT GetEssenceDescriptor(IAAFEssenceDescriptor** ppEssence) = 0;
    virtual AAFRESULT SetEssenceDescriptor(IAAFEssenceDescriptor* pEssence) = 0;
    virtual AAFRESULT AddNilReference(aafSlotID_t slotID, aafLength_t length, IAAFDataDef* pDataDef,
                                      aafRational_t editRate) = 0;
    virtual AAFRESULT AppendTimecodeSlot(aafRational_t editrate, aafInt32 slotID, aafTimecode_t startTC,
                                         aafFrameLength_t length32) = 0;
    virtual AAFRESULT AppendEdgecodeSlot(aafRational_t editrate, aafInt32 slotID, aafFrameOffset_t startEC,
                                         aafFrameLength_t length32, aafFilmType_t filmKind, aafEdgeType_t codeFormat,
                                         aafEdgecode_t header) = 0;
    virtual AAFRESULT SpecifyValidCodeRange(IAAFDataDef* pEssenceKind, aafSlotID_t slotID, aafRational_t editrate,
                                            aafFrameOffset_t startOffset, aafFrameLength_t length32) = 0;
    virtual AAFRESULT AppendPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot, IAAFDataDef* pEssenceKind,
                                          aafSourceRef_t ref, aafLength_t srcRefLength) = 0;
    virtual AAFRESULT NewPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot, IAAFDataDef* pEssenceKind,
                                       aafSourceRef_t ref, aafLength_t srcRefLength) = 0;
    virtual AAFRESULT AddPulldownRef(aafAppendOption_t addType, aafRational_t editrate, aafSlotID_t aMobSlot,
                                     IAAFDataDef* pEssenceKind, aafSourceRef_t ref, aafLength_t srcRefLength,
                                     aafPulldownKind_t pulldownKind, aafPhaseFrame_t phaseFrame,
                                     aafPulldownDir_t direction) = 0;

protected:
    ~IAAFSourceMob() = default;
};
AAF_INTERFACE_ID(IAAFSourceMob);
