#pragma once
/// A component at a position in an event slot.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFEvent : public IUnknown {
public:
    virtual AAFRESULT GetPosition(aafPosition_t* pPosition) = 0;
    virtual AAFRESULT SetPosition(aafPosition_t Position) = 0;
    virtual AAFRESULT SetComment(aafCharacter_constptr pComment) = 0;
    virtual AAFRESULT GetComment(aafCharacter* pComment, aafUInt32 bufSize) = 0;
    virtual AAFRESULT GetCommentBufLen(aafUInt32* pBufSize) = 0;

protected:
    ~IAAFEvent() = default;
};
AAF_INTERFACE_ID(IAAFEvent);
