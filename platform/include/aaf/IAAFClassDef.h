#pragma once
/// A class: parent, property definitions, and the factory of its instances.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFClassDef : public IUnknown {
public:
    virtual AAFRESULT Initialize(aafUID_constref classID, IAAFClassDef* pParentClass, aafCharacter_constptr pClassName,
                                 aafBool isConcrete) = 0;
    virtual AAFRESULT GetPropertyDefs(IEnumAAFPropertyDefs** ppEnum) = 0;
    virtual AAFRESULT CountPropertyDefs(aafUInt32* pCount) = 0;
    virtual AAFRESULT RegisterNewPropertyDef(aafUID_constref id, aafCharacter_constptr pName, IAAFTypeDef* pTypeDef,
                                             aafBool isOptional, aafBool isUniqueIdentifier,
                                             IAAFPropertyDef** ppPropDef) = 0;
    virtual AAFRESULT RegisterOptionalPropertyDef(aafUID_constref id, aafCharacter_constptr pName,
                                                  IAAFTypeDef* pTypeDef, IAAFPropertyDef** ppPropDef) = 0;
    virtual AAFRESULT LookupPropertyDef(aafUID_constref propID, IAAFPropertyDef** ppPropDef) = 0;
    virtual AAFRESULT GetName(aafCharacter* pName, aafUInt32 bufSize) = 0;
    virtual AAFRESULT GetNameBufLen(aafUInt32* pBufSize) = 0;
    virtual AAFRESULT GetParent(IAAFClassDef** ppClassDef) = 0;
    virtual AAFRESULT IsConcrete(aafBool* pResult) = 0;
    virtual AAFRESULT IsRoot(aafBool* pIsRoot) = 0;
    virtual AAFRESULT IsUniquelyIdentified(aafBool* pIsUniquelyIdentified) = 0;
    virtual AAFRESULT GetUniqueIdentifier(IAAFPropertyDef** ppUniqueIdentifier) = 0;
    virtual AAFRESULT CreateInstance(REFIID riid, IUnknown** ppvObject) = 0;

protected:
    ~IAAFClassDef() = default;
};
AAF_INTERFACE_ID(IAAFClassDef);
