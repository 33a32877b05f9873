#pragma once
/// A marker that carries descriptive metadata.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFDescriptiveMarker : public IUnknown {
public:
    virtual AAFRESULT Initialize() = 0;
    virtual AAFRESULT SetDescribedSlotIDs(aafUInt32 numberElements, aafUInt32* pDescribedSlotIDs) = 0;
    virtual AAFRESULT GetDescribedSlotIDs(aafUInt32 numberElements, aafUInt32* pDescribedSlotIDs) = 0;
    virtual AAFRESULT GetDescribedSlotIDsSize(aafUInt32* numberElements) = 0;
    virtual AAFRESULT SetDescription(IUnknown* pDescription) = 0;
    virtual AAFRESULT GetDescription(IUnknown** ppDescription) = 0;

protected:
    ~IAAFDescriptiveMarker() = default;
};
AAF_INTERFACE_ID(IAAFDescriptiveMarker);
