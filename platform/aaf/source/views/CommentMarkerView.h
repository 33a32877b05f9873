#pragma once
/// A comment marker.
#include "../core/ViewBase.h"
#include "aaf/IAAFCommentMarker.h"

namespace aafmodel {

class CommentMarkerView final : public View<IAAFCommentMarker> {
public:
    using View::View;

    AAFRESULT GetAnnotation(IAAFSourceReference** ppResult) override;
    AAFRESULT SetAnnotation(IAAFSourceReference* pAnnotation) override;
};

}  // namespace aafmodel
