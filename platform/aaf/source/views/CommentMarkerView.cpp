#include "CommentMarkerView.h"

namespace aafmodel {

// Annotations (source references on markers) are not kept by this library.
AAFRESULT CommentMarkerView::GetAnnotation(IAAFSourceReference**) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT CommentMarkerView::SetAnnotation(IAAFSourceReference*) { return AAFRESULT_NOT_IMPLEMENTED; }

}  // namespace aafmodel
