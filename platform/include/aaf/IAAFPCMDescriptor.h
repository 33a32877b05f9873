#pragma once
/// Describes PCM sound essence.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFPCMDescriptor : public IUnknown {
public:
    virtual AAFRESULT Initialize() = 0;
    virtual AAFRESULT SetBlockAlign(aafUInt16 blockAlign) = 0;
    virtual AAFRESULT GetBlockAlign(aafUInt16* pBlockAlign) = 0;
    virtual AAFRESULT SetSequenceOffset(aafUInt8 offset) = 0;
    virtual AAFRESULT GetSequenceOffset(aafUInt8* pOffset) = 0;
    virtual AAFRESULT SetAverageBPS(aafUInt32 bps) = 0;
    virtual AAFRESULT GetAverageBPS(aafUInt32* pBps) = 0;

protected:
    ~IAAFPCMDescriptor() = default;
};
AAF_INTERFACE_ID(IAAFPCMDescriptor);
