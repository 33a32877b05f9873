#pragma once
/// Describes essence held in a file: sample rate and length.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFFileDescriptor : public IUnknown {
public:
    virtual AAFRESULT SetLength(aafLength_t length) = 0;
    virtual AAFRESULT GetLength(aafLength_t* pLength) = 0;
    virtual AAFRESULT SetCodecDef(IAAFCodecDef* pDef) = 0;
    virtual AAFRESULT GetCodecDef(IAAFCodecDef** ppDef) = 0;
    virtual AAFRESULT SetSampleRate(aafRational_constref rate) = 0;
    virtual AAFRESULT GetSampleRate(aafRational_t* pRate) = 0;
    virtual AAFRESULT SetContainerFormat(IAAFContainerDef* pFormat) = 0;
    virtual AAFRESULT GetContainerFormat(IAAFContainerDef** ppFormat) = 0;

protected:
    ~IAAFFileDescriptor() = default;
};
AAF_INTERFACE_ID(IAAFFileDescriptor);
