#pragma once
/// A data definition: sound, timecode, picture and kin.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFDataDef : public IUnknown {
public:
    virtual AAFRESULT Initialize(aafUID_constref id, aafCharacter_constptr pName,
                                 aafCharacter_constptr pDescription) = 0;
    virtual AAFRESULT IsPictureKind(aafBool* bIsPictureKind) = 0;
    virtual AAFRESULT IsMatteKind(aafBool* bIsMatteKind) = 0;
    virtual AAFRESULT IsPictureWithMatteKind(aafBool* bIsPictureWithMatteKind) = 0;
    virtual AAFRESULT IsSoundKind(aafBool* bIsSoundKind) = 0;
    virtual AAFRESULT DoesDataDefConvertTo(IAAFDataDef* id, aafBool* bDoesConvertTo) = 0;
    virtual AAFRESULT IsDataDefOf(IAAFDataDef* pDataDef, aafBool* bIsDataDefOf) = 0;
    virtual AAFRESULT DoesDataDefConvertFrom(IAAFDataDef* pDataDef, aafBool* bDoesConvertFrom) = 0;
    virtual AAFRESULT IsEdgecodeKind(aafBool* bIsEdgecodeKind) = 0;
    virtual AAFRESULT IsTimecodeKind(aafBool* bIsTimecodeKind) = 0;

protected:
    ~IAAFDataDef() = default;
};
AAF_INTERFACE_ID(IAAFDataDef);
