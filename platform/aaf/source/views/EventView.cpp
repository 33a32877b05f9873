#include "EventView.h"

#include "../core/Schema.h"
#include "../core/WideText.h"
#include "ViewSupport.h"

namespace aafmodel {

AAFRESULT EventView::GetPosition(aafPosition_t* pPosition) {
    return Guarded([&] {
        Require(pPosition);
        *pPosition = m_object.GetRequired<aafPosition_t>(*Builtins(m_object).p.eventPosition);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT EventView::SetPosition(aafPosition_t Position) {
    return Guarded([&] {
        m_object.SetFixed(*Builtins(m_object).p.eventPosition, Position);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT EventView::SetComment(aafCharacter_constptr pComment) {
    return Guarded([&] {
        m_object.SetString(*Builtins(m_object).p.eventComment, WideArg(pComment));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT EventView::GetComment(aafCharacter* pComment, aafUInt32 bufSize) {
    return Guarded([&] {
        CopyStringProperty(m_object, *Builtins(m_object).p.eventComment, pComment, bufSize);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT EventView::GetCommentBufLen(aafUInt32* pBufSize) {
    return Guarded([&] {
        Require(pBufSize);
        *pBufSize = StringPropertyBufLen(m_object, *Builtins(m_object).p.eventComment);
        return AAFRESULT_SUCCESS;
    });
}

}  // namespace aafmodel
