#pragma once
/// Describes picture essence; the descriptor extensions add image boxes to it.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFDigitalImageDescriptor : public IUnknown {
public:
    virtual AAFRESULT SetCompression(aafUID_constref compression) = 0;
    virtual AAFRESULT GetCompression(aafUID_t* pCompression) = 0;
    virtual AAFRESULT SetStoredView(aafUInt32 StoredHeight, aafUInt32 StoredWidth) = 0;
    virtual AAFRESULT GetStoredView(aafUInt32* pStoredHeight, aafUInt32* pStoredWidth) = 0;
    virtual AAFRESULT SetSampledView(aafUInt32 SampledHeight, aafUInt32 SampledWidth, aafInt32 SampledXOffset,
                                     aafInt32 SampledYOffset) = 0;
    virtual AAFRESULT GetSampledView(aafUInt32* pSampledHeight, aafUInt32* pSampledWidth, aafInt32* pSampledXOffset,
                                     aafInt32* pSampledYOffset) = 0;
    virtual AAFRESULT SetDisplayView(aafUInt32 DisplayedHeight, aafUInt32 DisplayedWidth, aafInt32 DisplayedXOffset,
                                     aafInt32 DisplayedYOffset) = 0;
    virtual AAFRESULT GetDisplayView(aafUInt32* pDisplayedHeight, aafUInt32* pDisplayedWidth,
                                     aafInt32* pDisplayedXOffset, aafInt32* pDisplayedYOffset) = 0;
    virtual AAFRESULT SetFrameLayout(aafFrameLayout_t FrameLayout) = 0;
    virtual AAFRESULT GetFrameLayout(aafFrameLayout_t* pFrameLayout) = 0;
    virtual AAFRESULT SetVideoLineMap(aafUInt32 numberElements, aafInt32* pVideoLineMap) = 0;
    virtual AAFRESULT GetVideoLineMap(aafUInt32 numberElements, aafInt32* pVideoLineMap) = 0;
    virtual AAFRESULT GetVideoLineMapSize(aafUInt32* pNumberElements) = 0;
    virtual AAFRESULT SetImageAspectRatio(aafRational_t ImageAspectRatio) = 0;
    virtual AAFRESULT GetImageAspectRatio(aafRational_t* pImageAspectRatio) = 0;
    virtual AAFRESULT SetAlphaTransparency(aafAlphaTransparency_t AlphaTransparency) = 0;
    virtual AAFRESULT GetAlphaTransparency(aafAlphaTransparency_t* pAlphaTransparency) = 0;
    virtual AAFRESULT SetGamma(aafUID_t Gamma) = 0;
    virtual AAFRESULT GetGamma(aafUID_t* pGamma) = 0;
    virtual AAFRESULT SetImageAlignmentFactor(aafUInt32 ImageAlignmentFactor) = 0;
    virtual AAFRESULT GetImageAlignmentFactor(aafUInt32* pImageAlignmentFactor) = 0;

protected:
    ~IAAFDigitalImageDescriptor() = default;
};
AAF_INTERFACE_ID(IAAFDigitalImageDescriptor);
