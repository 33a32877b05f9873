#pragma once
/// What every class, property and type definition has: an id and a name.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFMetaDefinition : public IUnknown {
public:
    virtual AAFRESULT Initialize(aafUID_constref id, aafCharacter_constptr pName,
                                 aafCharacter_constptr pDescription) = 0;
    virtual AAFRESULT GetAUID(aafUID_t* pAuid) = 0;
    virtual AAFRESULT SetName(aafCharacter_constptr pName) = 0;
    virtual AAFRESULT GetName(aafCharacter* pName, aafUInt32 bufSize) = 0;
    virtual AAFRESULT GetNameBufLen(aafUInt32* pBufSize) = 0;
    virtual AAFRESULT SetDescription(aafCharacter_constptr pDescription) = 0;
    virtual AAFRESULT GetDescription(aafCharacter* pDescription, aafUInt32 bufSize) = 0;
    virtual AAFRESULT GetDescriptionBufLen(aafUInt32* pBufSize) = 0;

protected:
    ~IAAFMetaDefinition() = default;
};
AAF_INTERFACE_ID(IAAFMetaDefinition);
