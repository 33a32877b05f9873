#include "DigitalImageDescriptorView.h"

#include "ViewSupport.h"

namespace aafmodel {

namespace {
using P = BuiltinDefinitions::Properties;
}  // namespace

AAFRESULT DigitalImageDescriptorView::SetCompression(aafUID_constref compression) {
    return SetBuiltin(m_object, &P::imageCompression, compression);
}
AAFRESULT DigitalImageDescriptorView::GetCompression(aafUID_t* pCompression) {
    return GetBuiltin(m_object, &P::imageCompression, pCompression);
}
AAFRESULT DigitalImageDescriptorView::SetStoredView(aafUInt32 StoredHeight, aafUInt32 StoredWidth) {
    return Guarded([&] {
        Check(SetBuiltin(m_object, &P::imageStoredHeight, StoredHeight));
        return SetBuiltin(m_object, &P::imageStoredWidth, StoredWidth);
    });
}
AAFRESULT DigitalImageDescriptorView::GetStoredView(aafUInt32* pStoredHeight, aafUInt32* pStoredWidth) {
    return Guarded([&] {
        // Both or neither: a caller never sees half a size.
        Require(pStoredHeight);
        Require(pStoredWidth);
        aafUInt32 height = 0;
        Check(GetBuiltin(m_object, &P::imageStoredHeight, &height));
        Check(GetBuiltin(m_object, &P::imageStoredWidth, pStoredWidth));
        *pStoredHeight = height;
        return AAFRESULT_SUCCESS;
    });
}
// Sampled and displayed areas, frame layout, line map and alpha are not kept
// by this library: its callers describe sound, and image boxes say where the
// picture lies.
AAFRESULT DigitalImageDescriptorView::SetSampledView(aafUInt32, aafUInt32, aafInt32, aafInt32) {
    return AAFRESULT_NOT_IMPLEMENTED;
}
AAFRESULT DigitalImageDescriptorView::GetSampledView(aafUInt32*, aafUInt32*, aafInt32*, aafInt32*) {
    return AAFRESULT_NOT_IMPLEMENTED;
}
AAFRESULT DigitalImageDescriptorView::SetDisplayView(aafUInt32, aafUInt32, aafInt32, aafInt32) {
    return AAFRESULT_NOT_IMPLEMENTED;
}
AAFRESULT DigitalImageDescriptorView::GetDisplayView(aafUInt32*, aafUInt32*, aafInt32*, aafInt32*) {
    return AAFRESULT_NOT_IMPLEMENTED;
}
AAFRESULT DigitalImageDescriptorView::SetFrameLayout(aafFrameLayout_t) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DigitalImageDescriptorView::GetFrameLayout(aafFrameLayout_t*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DigitalImageDescriptorView::SetVideoLineMap(aafUInt32, aafInt32*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DigitalImageDescriptorView::GetVideoLineMap(aafUInt32, aafInt32*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DigitalImageDescriptorView::GetVideoLineMapSize(aafUInt32*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DigitalImageDescriptorView::SetImageAspectRatio(aafRational_t ImageAspectRatio) {
    return SetBuiltin(m_object, &P::imageAspectRatio, ImageAspectRatio);
}
AAFRESULT DigitalImageDescriptorView::GetImageAspectRatio(aafRational_t* pImageAspectRatio) {
    return GetBuiltin(m_object, &P::imageAspectRatio, pImageAspectRatio);
}
AAFRESULT DigitalImageDescriptorView::SetAlphaTransparency(aafAlphaTransparency_t) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DigitalImageDescriptorView::GetAlphaTransparency(aafAlphaTransparency_t*) {
    return AAFRESULT_NOT_IMPLEMENTED;
}
AAFRESULT DigitalImageDescriptorView::SetGamma(aafUID_t Gamma) { return SetBuiltin(m_object, &P::imageGamma, Gamma); }
AAFRESULT DigitalImageDescriptorView::GetGamma(aafUID_t* pGamma) {
    return GetBuiltin(m_object, &P::imageGamma, pGamma);
}
AAFRESULT DigitalImageDescriptorView::SetImageAlignmentFactor(aafUInt32 ImageAlignmentFactor) {
    return SetBuiltin(m_object, &P::imageAlignmentFactor, ImageAlignmentFactor);
}
AAFRESULT DigitalImageDescriptorView::GetImageAlignmentFactor(aafUInt32* pImageAlignmentFactor) {
    return GetBuiltin(m_object, &P::imageAlignmentFactor, pImageAlignmentFactor);
}

}  // namespace aafmodel
