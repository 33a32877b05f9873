#pragma once
/// What every slot does: id, name, physical number and segment.
#include "../core/ViewBase.h"
#include "aaf/IAAFMobSlot.h"

namespace aafmodel {

class MobSlotView final : public View<IAAFMobSlot> {
public:
    using View::View;

    AAFRESULT GetSegment(IAAFSegment** ppResult) override;
    AAFRESULT SetName(aafCharacter_constptr pName) override;
    AAFRESULT GetName(aafCharacter* pName, aafUInt32 bufSize) override;
    AAFRESULT GetNameBufLen(aafUInt32* pBufSize) override;
    AAFRESULT GetPhysicalNum(aafUInt32* pResult) override;
    AAFRESULT GetDataDef(IAAFDataDef** ppResult) override;
    AAFRESULT GetSlotID(aafSlotID_t* pResult) override;
    AAFRESULT SetSegment(IAAFSegment* pSegment) override;
    AAFRESULT SetPhysicalNum(aafUInt32 physicalNum) override;
    AAFRESULT SetSlotID(aafSlotID_t value) override;
};

}  // namespace aafmodel
