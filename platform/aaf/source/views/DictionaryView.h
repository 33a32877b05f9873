#pragma once
/// The dictionary of a file: the factory of objects and the look-up of definitions.
#include "../core/ViewBase.h"
#include "aaf/IAAFDictionary.h"

namespace aafmodel {

class DictionaryView final : public View<IAAFDictionary> {
public:
    using View::View;

    AAFRESULT CreateInstance(aafUID_constref id, REFIID riid, IUnknown** ppvObject) override;
    AAFRESULT CreateMetaInstance(aafUID_constref id, REFIID riid, IUnknown** ppMetaDefinition) override;
    AAFRESULT RegisterClassDef(IAAFClassDef* pClassDef) override;
    AAFRESULT LookupClassDef(aafUID_constref classId, IAAFClassDef** ppClassDef) override;
    AAFRESULT GetClassDefs(IEnumAAFClassDefs** ppEnum) override;
    AAFRESULT CountClassDefs(aafUInt32* pResult) override;
    AAFRESULT CreateForwardClassReference(aafUID_constref classId) override;
    AAFRESULT HasForwardClassReference(aafUID_constref classId, aafBool* pResult) override;
    AAFRESULT RegisterTypeDef(IAAFTypeDef* pTypeDef) override;
    AAFRESULT LookupTypeDef(aafUID_constref typeId, IAAFTypeDef** ppTypeDef) override;
    AAFRESULT GetTypeDefs(IEnumAAFTypeDefs** ppEnum) override;
    AAFRESULT CountTypeDefs(aafUInt32* pResult) override;
    AAFRESULT RegisterOpaqueTypeDef(IAAFTypeDef* pTypeDef) override;
    AAFRESULT LookupOpaqueTypeDef(aafUID_constref typeId, IAAFTypeDef** ppTypeDef) override;
    AAFRESULT GetOpaqueTypeDefs(IEnumAAFTypeDefs** ppEnum) override;
    AAFRESULT CountOpaqueTypeDefs(aafUInt32* pResult) override;
    AAFRESULT RegisterKLVDataKey(aafUID_t pUID, IAAFTypeDef* pTypeDef) override;
    AAFRESULT RegisterDataDef(IAAFDataDef* pDataDef) override;
    AAFRESULT LookupDataDef(aafUID_constref dataDefinitionId, IAAFDataDef** ppDataDef) override;
    AAFRESULT GetDataDefs(IEnumAAFDataDefs** ppEnum) override;
    AAFRESULT CountDataDefs(aafUInt32* pResult) override;
    AAFRESULT RegisterOperationDef(IAAFOperationDef* pOperationDef) override;
    AAFRESULT LookupOperationDef(aafUID_constref operationId, IAAFOperationDef** ppOperationDef) override;
    AAFRESULT GetOperationDefs(IEnumAAFOperationDefs** ppEnum) override;
    AAFRESULT CountOperationDefs(aafUInt32* pResult) override;
    AAFRESULT RegisterParameterDef(IAAFParameterDef* pParmDef) override;
    AAFRESULT LookupParameterDef(aafUID_constref parameterId, IAAFParameterDef** ppParmDef) override;
    AAFRESULT GetParameterDefs(IEnumAAFParameterDefs** ppEnum) override;
    AAFRESULT CountParameterDefs(aafUInt32* pResult) override;
    AAFRESULT RegisterCodecDef(IAAFCodecDef* pParmDef) override;
    AAFRESULT LookupCodecDef(aafUID_constref parameterId, IAAFCodecDef** ppParmDef) override;
    AAFRESULT GetCodecDefs(IEnumAAFCodecDefs** ppEnum) override;
    AAFRESULT CountCodecDefs(aafUInt32* pResult) override;
    AAFRESULT RegisterContainerDef(IAAFContainerDef* pParmDef) override;
    AAFRESULT LookupContainerDef(aafUID_constref parameterId, IAAFContainerDef** ppParmDef) override;
    AAFRESULT GetContainerDefs(IEnumAAFContainerDefs** ppEnum) override;
    AAFRESULT CountContainerDefs(aafUInt32* pResult) override;
    AAFRESULT RegisterInterpolationDef(IAAFInterpolationDef* pInterpolationDef) override;
    AAFRESULT LookupInterpolationDef(aafUID_constref parameterId, IAAFInterpolationDef** ppInterpolationDef) override;
    AAFRESULT GetInterpolationDefs(IEnumAAFInterpolationDefs** ppEnum) override;
    AAFRESULT CountInterpolationDefs(aafUInt32* pResult) override;
    AAFRESULT RegisterPluginDef(IAAFPluginDef* pPlugDef) override;
    AAFRESULT LookupPluginDef(aafUID_constref parameterId, IAAFPluginDef** ppPlugDef) override;
    AAFRESULT GetPluginDefs(IEnumAAFPluginDefs** ppEnum) override;
    AAFRESULT CountPluginDefs(aafUInt32* pResult) override;
};

}  // namespace aafmodel
