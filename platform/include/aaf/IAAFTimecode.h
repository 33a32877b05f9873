#pragma once
/// A run of timecode.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFTimecode : public IUnknown {
public:
    virtual AAFRESULT Initialize(aafLength_t length, aafTimecode_t* pTimecode) = 0;
    virtual AAFRESULT GetTimecode(aafTimecode_t* pTimecode) = 0;
    virtual AAFRESULT SetTimecode(aafTimecode_t* pTimecode) = 0;

protected:
    ~IAAFTimecode() = default;
};
AAF_INTERFACE_ID(IAAFTimecode);
