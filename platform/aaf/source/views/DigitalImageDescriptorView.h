#pragma once
/// The properties of a picture descriptor that a caller of this library can
/// set: compression, stored size, aspect ratio, gamma and alignment. The
/// image extensions need the interface to reach a descriptor's object.
#include "../core/ViewBase.h"
#include "aaf/IAAFDigitalImageDescriptor.h"

namespace aafmodel {

class DigitalImageDescriptorView final : public View<IAAFDigitalImageDescriptor> {
public:
    using View::View;

    AAFRESULT SetCompression(aafUID_constref compression) override;
    AAFRESULT GetCompression(aafUID_t* pCompression) override;
    AAFRESULT SetStoredView(aafUInt32 StoredHeight, aafUInt32 StoredWidth) override;
    AAFRESULT GetStoredView(aafUInt32* pStoredHeight, aafUInt32* pStoredWidth) override;
    AAFRESULT SetSampledView(aafUInt32 SampledHeight, aafUInt32 SampledWidth, aafInt32 SampledXOffset,
                             aafInt32 SampledYOffset) override;
    AAFRESULT GetSampledView(aafUInt32* pSampledHeight, aafUInt32* pSampledWidth, aafInt32* pSampledXOffset,
                             aafInt32* pSampledYOffset) override;
    AAFRESULT SetDisplayView(aafUInt32 DisplayedHeight, aafUInt32 DisplayedWidth, aafInt32 DisplayedXOffset,
                             aafInt32 DisplayedYOffset) override;
    AAFRESULT GetDisplayView(aafUInt32* pDisplayedHeight, aafUInt32* pDisplayedWidth, aafInt32* pDisplayedXOffset,
                             aafInt32* pDisplayedYOffset) override;
    AAFRESULT SetFrameLayout(aafFrameLayout_t FrameLayout) override;
    AAFRESULT GetFrameLayout(aafFrameLayout_t* pFrameLayout) override;
    AAFRESULT SetVideoLineMap(aafUInt32 numberElements, aafInt32* pVideoLineMap) override;
    AAFRESULT GetVideoLineMap(aafUInt32 numberElements, aafInt32* pVideoLineMap) override;
    AAFRESULT GetVideoLineMapSize(aafUInt32* pNumberElements) override;
    AAFRESULT SetImageAspectRatio(aafRational_t ImageAspectRatio) override;
    AAFRESULT GetImageAspectRatio(aafRational_t* pImageAspectRatio) override;
    AAFRESULT SetAlphaTransparency(aafAlphaTransparency_t AlphaTransparency) override;
    AAFRESULT GetAlphaTransparency(aafAlphaTransparency_t* pAlphaTransparency) override;
    AAFRESULT SetGamma(aafUID_t Gamma) override;
    AAFRESULT GetGamma(aafUID_t* pGamma) override;
    AAFRESULT SetImageAlignmentFactor(aafUInt32 ImageAlignmentFactor) override;
    AAFRESULT GetImageAlignmentFactor(aafUInt32* pImageAlignmentFactor) override;
};

}  // namespace aafmodel
