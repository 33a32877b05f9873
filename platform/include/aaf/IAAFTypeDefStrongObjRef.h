#pragma once
/// A reference that owns its object.
#include "aaf/IAAFTypeDefObjectRef.h"

class IAAFTypeDefStrongObjRef : public IAAFTypeDefObjectRef {
public:
    virtual AAFRESULT Initialize(aafUID_constref id, IAAFClassDef* pObjType, aafCharacter_constptr pTypeName) = 0;

protected:
    ~IAAFTypeDefStrongObjRef() = default;
};
AAF_INTERFACE_ID(IAAFTypeDefStrongObjRef);
