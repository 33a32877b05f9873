#pragma once
/// The definitions of a file: classes, types, properties, data definitions; the factory of objects.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFDictionary : public IUnknown {
public:
    virtual AAFRESULT CreateInstance(aafUID_constref id, REFIID riid, IUnknown** ppvObject) = 0;
    virtual AAFRESULT CreateMetaInstance(aafUID_constref id, REFIID riid, IUnknown** ppMetaDefinition) = 0;
    virtual AAFRESULT RegisterClassDef(IAAFClassDef* pClassDef) = 0;
    virtual AAFRESULT LookupClassDef(aafUID_constref classId, IAAFClassDef** ppClassDef) = 0;
    virtual AAFRESULT GetClassDefs(IEnumAAFClassDefs** ppEnum) = 0;
    virtual AAFRESULT CountClassDefs(aafUInt32* pResult) = 0;
    virtual AAFRESULT CreateForwardClassReference(aafUID_constref classId) = 0;
    virtual AAFRESULT HasForwardClassReference(aafUID_constref classId, aafBool* pResult) = 0;
    virtual AAFRESULT RegisterTypeDef(IAAFTypeDef* pTypeDef) = 0;
    virtual AAFRESULT LookupTypeDef(aafUID_constref typeId, IAAFTypeDef** ppTypeDef) = 0;
    virtual AAFRESULT GetTypeDefs(IEnumAAFTypeDefs** ppEnum) = 0;
    virtual AAFRESULT CountTypeDefs(aafUInt32* pResult) = 0;
    virtual AAFRESULT RegisterOpaqueTypeDef(IAAFTypeDef* pTypeDef) = 0;
    virtual AAFRESULT LookupOpaqueTypeDef(aafUID_constref typeId, IAAFTypeDef** ppTypeDef) = 0;
    virtual AAFRESULT GetOpaqueTypeDefs(IEnumAAFTypeDefs** ppEnum) = 0;
    virtual AAFRESULT CountOpaqueTypeDefs(aafUInt32* pResult) = 0;
    virtual AAFRESULT RegisterKLVDataKey(aafUID_t pUID, IAAFTypeDef* pTypeDef) = 0;
    virtual AAFRESULT RegisterDataDef(IAAFDataDef* pDataDef) = 0;
    virtual AAFRESULT LookupDataDef(aafUID_constref dataDefinitionId, IAAFDataDef** ppDataDef) = 0;
    virtual AAFRESULT GetDataDefs(IEnumAAFDataDefs** ppEnum) = 0;
    virtual AAFRESULT CountDataDefs(aafUInt32* pResult) = 0;
    virtual AAFRESULT RegisterOperationDef(IAAFOperationDef* pOperationDef) = 0;
    virtual AAFRESULT LookupOperationDef(aafUID_constref operationId, IAAFOperationDef** ppOperationDef) = 0;
    virtual AAFRESULT GetOperationDefs(IEnumAAFOperationDefs** ppEnum) = 0;
    virtual AAFRESULT CountOperationDefs(aafUInt32* pResult) = 0;
    virtual AAFRESULT RegisterParameterDef(IAAFParameterDef* pParmDef) = 0;
    virtual AAFRESULT LookupParameterDef(aafUID_constref parameterId, IAAFParameterDef** ppParmDef) = 0;
    virtual AAFRESULT GetParameterDefs(IEnumAAFParameterDefs** ppEnum) = 0;
    virtual AAFRESULT CountParameterDefs(aafUInt32* pResult) = 0;
    virtual AAFRESULT RegisterCodecDef(IAAFCodecDef* pParmDef) = 0;
    virtual AAFRESULT LookupCodecDef(aafUID_constref parameterId, IAAFCodecDef** ppParmDef) = 0;
    virtual AAFRESULT GetCodecDefs(IEnumAAFCodecDefs** ppEnum) = 0;
    virtual AAFRESULT CountCodecDefs(aafUInt32* pResult) = 0;
    virtual AAFRESULT RegisterContainerDef(IAAFContainerDef* pParmDef) = 0;
    virtual AAFRESULT LookupContainerDef(aafUID_constref parameterId, IAAFContainerDef** ppParmDef) = 0;
    virtual AAFRESULT GetContainerDefs(IEnumAAFContainerDefs** ppEnum) = 0;
    virtual AAFRESULT CountContainerDefs(aafUInt32* pResult) = 0;
    virtual AAFRESULT RegisterInterpolationDef(IAAFInterpolationDef* pInterpolationDef) = 0;
    virtual AAFRESULT LookupInterpolationDef(aafUID_constref parameterId,
                                             IAAFInterpolationDef** ppInterpolationDef) = 0;
    virtual AAFRESULT GetInterpolationDefs(IEnumAAFInterpolationDefs** ppEnum) = 0;
    virtual AAFRESULT CountInterpolationDefs(aafUInt32* pResult) = 0;
    virtual AAFRESULT RegisterPluginDef(IAAFPluginDef* pPlugDef) = 0;
    virtual AAFRESULT LookupPluginDef(aafUID_constref parameterId, IAAFPluginDef** ppPlugDef) = 0;
    virtual AAFRESULT GetPluginDefs(IEnumAAFPluginDefs** ppEnum) = 0;
    virtual AAFRESULT CountPluginDefs(aafUInt32* pResult) = 0;

protected:
    ~IAAFDictionary() = default;
};
AAF_INTERFACE_ID(IAAFDictionary);
