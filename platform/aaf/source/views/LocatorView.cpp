#include "LocatorView.h"

#include "../core/Schema.h"
#include "../core/WideText.h"
#include "ViewSupport.h"

namespace aafmodel {

AAFRESULT LocatorView::SetPath(aafCharacter_constptr pPath) {
    return Guarded([&] {
        m_object.SetString(*Builtins(m_object).p.networkURLString, WideArg(pPath));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT LocatorView::GetPath(aafCharacter* pPath, aafUInt32 bufSize) {
    return Guarded([&] {
        CopyStringProperty(m_object, *Builtins(m_object).p.networkURLString, pPath, bufSize);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT LocatorView::GetPathBufLen(aafUInt32* pBufSize) {
    return Guarded([&] {
        Require(pBufSize);
        *pBufSize = StringPropertyBufLen(m_object, *Builtins(m_object).p.networkURLString);
        return AAFRESULT_SUCCESS;
    });
}

}  // namespace aafmodel
