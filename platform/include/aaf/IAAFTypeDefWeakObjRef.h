#pragma once
/// A reference by identity to a definition kept elsewhere.
#include "aaf/IAAFTypeDefObjectRef.h"

class IAAFTypeDefWeakObjRef : public IAAFTypeDefObjectRef {
public:
    virtual AAFRESULT Initialize(aafUID_constref id, IAAFClassDef* pObjType, aafCharacter_constptr pTypeName,
                                 aafUInt32 ids, aafUID_constptr pTargetSet) = 0;

protected:
    ~IAAFTypeDefWeakObjRef() = default;
};
AAF_INTERFACE_ID(IAAFTypeDefWeakObjRef);
