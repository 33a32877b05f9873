#pragma once
/// A reference to an object of a given class.
#include "aaf/IAAFTypeDef.h"

class IAAFTypeDefObjectRef : public IAAFTypeDef {
public:
    virtual AAFRESULT GetObjectType(IAAFClassDef** ppObjType) = 0;
    virtual AAFRESULT CreateValue(IUnknown* pObj, IAAFPropertyValue** ppPropVal) = 0;
    virtual AAFRESULT GetObject(IAAFPropertyValue* pPropVal, REFIID iid, IUnknown** ppObject) = 0;
    virtual AAFRESULT SetObject(IAAFPropertyValue* pPropVal, IUnknown* pObject) = 0;

protected:
    ~IAAFTypeDefObjectRef() = default;
};
AAF_INTERFACE_ID(IAAFTypeDefObjectRef);
