#pragma once
/// A source reference with a start position.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFSourceClip : public IUnknown {
public:
    virtual AAFRESULT Initialize(IAAFDataDef* pDataDef, aafLength_constref length, aafSourceRef_t sourceRef) = 0;
    virtual AAFRESULT GetFade(aafLength_t* pFadeInLen, aafFadeType_t* pFadeInType, aafBool* pFadeInPresent,
                              aafLength_t* pFadeOutLen, aafFadeType_t* pFadeOutType, aafBool* pFadeOutPresent) = 0;
    virtual AAFRESULT ResolveRef(IAAFMob** ppMob) = 0;
    virtual AAFRESULT GetSourceReference(aafSourceRef_t* pSourceRef) = 0;
    virtual AAFRESULT SetFade(aafInt32 fadeInLen, aafFadeType_t fadeInType, aafInt32 fadeOutLen,
                              aafFadeType_t fadeOutType) = 0;
    virtual AAFRESULT SetSourceReference(aafSourceRef_t sourceRef) = 0;

protected:
    ~IAAFSourceClip() = default;
};
AAF_INTERFACE_ID(IAAFSourceClip);
