#include "FileDescriptorView.h"

#include "../core/Schema.h"
#include "ViewSupport.h"

namespace aafmodel {

AAFRESULT FileDescriptorView::SetLength(aafLength_t length) {
    return Guarded([&] {
        m_object.SetFixed(*Builtins(m_object).p.fileLength, length);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT FileDescriptorView::GetLength(aafLength_t* pLength) {
    return Guarded([&] {
        Require(pLength);
        *pLength = m_object.GetRequired<aafLength_t>(*Builtins(m_object).p.fileLength);
        return AAFRESULT_SUCCESS;
    });
}

// Codec and container definitions are not kept by this library.
AAFRESULT FileDescriptorView::SetCodecDef(IAAFCodecDef*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT FileDescriptorView::GetCodecDef(IAAFCodecDef**) { return AAFRESULT_NOT_IMPLEMENTED; }

AAFRESULT FileDescriptorView::SetSampleRate(aafRational_constref rate) {
    return Guarded([&] {
        m_object.SetFixed(*Builtins(m_object).p.fileSampleRate, rate);
        return AAFRESULT_SUCCESS;
    });
}

// A descriptor whose rate was never set reads as 0/0, which is how callers
// tell an unset rate (a multiple descriptor takes its first member's rate).
AAFRESULT FileDescriptorView::GetSampleRate(aafRational_t* pRate) {
    return Guarded([&] {
        Require(pRate);
        aafRational_t rate{0, 0};
        m_object.GetFixed(*Builtins(m_object).p.fileSampleRate, rate);
        *pRate = rate;
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT FileDescriptorView::SetContainerFormat(IAAFContainerDef*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT FileDescriptorView::GetContainerFormat(IAAFContainerDef**) { return AAFRESULT_NOT_IMPLEMENTED; }

}  // namespace aafmodel
