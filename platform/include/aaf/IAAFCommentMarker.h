#pragma once
/// An event that annotates.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFCommentMarker : public IUnknown {
public:
    virtual AAFRESULT GetAnnotation(IAAFSourceReference** ppResult) = 0;
    virtual AAFRESULT SetAnnotation(IAAFSourceReference* pAnnotation) = 0;

protected:
    ~IAAFCommentMarker() = default;
};
AAF_INTERFACE_ID(IAAFCommentMarker);
