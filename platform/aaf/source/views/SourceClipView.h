#pragma once
/// A source clip: a source reference with a start position.
#include "../core/ViewBase.h"
#include "aaf/IAAFSourceClip.h"

namespace aafmodel {

class SourceClipView final : public View<IAAFSourceClip> {
public:
    using View::View;

    AAFRESULT Initialize(IAAFDataDef* pDataDef, aafLength_constref length, aafSourceRef_t sourceRef) override;
    AAFRESULT GetFade(aafLength_t* pFadeInLen, aafFadeType_t* pFadeInType, aafBool* pFadeInPresent,
                      aafLength_t* pFadeOutLen, aafFadeType_t* pFadeOutType, aafBool* pFadeOutPresent) override;
    AAFRESULT ResolveRef(IAAFMob** ppMob) override;
    AAFRESULT GetSourceReference(aafSourceRef_t* pSourceRef) override;
    AAFRESULT SetFade(aafInt32 fadeInLen, aafFadeType_t fadeInType, aafInt32 fadeOutLen,
                      aafFadeType_t fadeOutType) override;
    AAFRESULT SetSourceReference(aafSourceRef_t sourceRef) override;
};

}  // namespace aafmodel
