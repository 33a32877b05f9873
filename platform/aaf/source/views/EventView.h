#pragma once
/// The position and comment of an event.
#include "../core/ViewBase.h"
#include "aaf/IAAFEvent.h"

namespace aafmodel {

class EventView final : public View<IAAFEvent> {
public:
    using View::View;

    AAFRESULT GetPosition(aafPosition_t* pPosition) override;
    AAFRESULT SetPosition(aafPosition_t Position) override;
    AAFRESULT SetComment(aafCharacter_constptr pComment) override;
    AAFRESULT GetComment(aafCharacter* pComment, aafUInt32 bufSize) override;
    AAFRESULT GetCommentBufLen(aafUInt32* pBufSize) override;
};

}  // namespace aafmodel
