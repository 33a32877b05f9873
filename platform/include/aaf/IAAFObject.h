#pragma once
/// The generic face of every object: its class and its properties.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFObject : public IUnknown {
public:
    virtual AAFRESULT SetGeneration(aafUID_constref generation) = 0;
    virtual AAFRESULT GetGeneration(IAAFIdentification** ppResult) = 0;
    virtual AAFRESULT GetGenerationAUID(aafUID_t* pResult) = 0;
    virtual AAFRESULT GetDefinition(IAAFClassDef** ppClassDef) = 0;
    virtual AAFRESULT GetProperties(IEnumAAFProperties** ppEnum) = 0;
    virtual AAFRESULT CountProperties(aafUInt32* pCount) = 0;
    virtual AAFRESULT GetPropertyValue(IAAFPropertyDef* pPropDef, IAAFPropertyValue** ppPropVal) = 0;
    virtual AAFRESULT SetPropertyValue(IAAFPropertyDef* pPropDef, IAAFPropertyValue* pPropVal) = 0;
    virtual AAFRESULT IsPropertyPresent(IAAFPropertyDef* pPropDef, aafBool* pResult) = 0;
    virtual AAFRESULT RemoveOptionalProperty(IAAFPropertyDef* pPropDef) = 0;
    virtual AAFRESULT CreateOptionalPropertyValue(IAAFPropertyDef* pPropDef, IAAFPropertyValue** ppPropVal) = 0;
    virtual AAFRESULT GetDictionary(IAAFDictionary** ppDictionary) = 0;
    virtual AAFRESULT EnableGenerationTracking() = 0;
    virtual AAFRESULT DisableGenerationTracking() = 0;
    virtual AAFRESULT IsGenerationTracked(aafBool* pResult) = 0;

protected:
    ~IAAFObject() = default;
};
AAF_INTERFACE_ID(IAAFObject);
