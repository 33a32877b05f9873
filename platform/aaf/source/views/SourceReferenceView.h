#pragma once
/// The referenced Mob and slot, and the channel and mono-slot identifiers.
#include "../core/ViewBase.h"
#include "aaf/IAAFSourceReference2.h"

namespace aafmodel {

class SourceReferenceView final : public View<IAAFSourceReference2, IAAFSourceReference> {
public:
    using View::View;

    AAFRESULT GetSourceID(aafMobID_t* pSourceID) override;
    AAFRESULT SetSourceID(aafMobID_constref sourceID) override;
    AAFRESULT GetSourceMobSlotID(aafSlotID_t* pMobSlotID) override;
    AAFRESULT SetSourceMobSlotID(aafSlotID_t mobSlotID) override;
    AAFRESULT SetChannelIDs(aafUInt32 numberElements, aafUInt32* pChannelIDs) override;
    AAFRESULT GetChannelIDs(aafUInt32 numberElements, aafUInt32* pChannelIDs) override;
    AAFRESULT GetChannelIDsSize(aafUInt32* numberElements) override;
    AAFRESULT SetMonoSourceSlotIDs(aafUInt32 numberElements, aafUInt32* pMonoSourceSlotIDs) override;
    AAFRESULT GetMonoSourceSlotIDs(aafUInt32 numberElements, aafUInt32* pMonoSourceSlotIDs) override;
    AAFRESULT GetMonoSourceSlotIDsSize(aafUInt32* numberElements) override;
};

}  // namespace aafmodel
