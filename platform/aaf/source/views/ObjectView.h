#pragma once
/// The generic face of every object: class and properties through the published generic interfaces.
#include "../core/ViewBase.h"
#include "aaf/IAAFObject.h"

namespace aafmodel {

class ObjectView final : public View<IAAFObject> {
public:
    using View::View;

    AAFRESULT SetGeneration(aafUID_constref generation) override;
    AAFRESULT GetGeneration(IAAFIdentification** ppResult) override;
    AAFRESULT GetGenerationAUID(aafUID_t* pResult) override;
    AAFRESULT GetDefinition(IAAFClassDef** ppClassDef) override;
    AAFRESULT GetProperties(IEnumAAFProperties** ppEnum) override;
    AAFRESULT CountProperties(aafUInt32* pCount) override;
    AAFRESULT GetPropertyValue(IAAFPropertyDef* pPropDef, IAAFPropertyValue** ppPropVal) override;
    AAFRESULT SetPropertyValue(IAAFPropertyDef* pPropDef, IAAFPropertyValue* pPropVal) override;
    AAFRESULT IsPropertyPresent(IAAFPropertyDef* pPropDef, aafBool* pResult) override;
    AAFRESULT RemoveOptionalProperty(IAAFPropertyDef* pPropDef) override;
    AAFRESULT CreateOptionalPropertyValue(IAAFPropertyDef* pPropDef, IAAFPropertyValue** ppPropVal) override;
    AAFRESULT GetDictionary(IAAFDictionary** ppDictionary) override;
    AAFRESULT EnableGenerationTracking() override;
    AAFRESULT DisableGenerationTracking() override;
    AAFRESULT IsGenerationTracked(aafBool* pResult) override;
};

}  // namespace aafmodel
