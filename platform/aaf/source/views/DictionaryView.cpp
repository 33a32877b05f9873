#include "DictionaryView.h"

#include "../core/ClassDefinition.h"
#include "../core/DataDefinition.h"
#include "../core/InternalIDs.h"
#include "../core/Schema.h"
#include "../core/TypeDefRecordType.h"
#include "ViewSupport.h"
#include "aaf/AAFClassDefUIDs.h"

namespace aafmodel {

namespace {
template <class Def, class Out>
AAFRESULT HandDefinition(Def* def, AAFRESULT missing, Out** out) {
    if (!out) return AAFRESULT_NULL_PARAM;
    if (!def) return missing;
    *out = def;
    def->AddRef();
    return AAFRESULT_SUCCESS;
}
}  // namespace

AAFRESULT DictionaryView::CreateInstance(aafUID_constref id, REFIID riid, IUnknown** ppvObject) {
    return Guarded([&] {
        Require(ppvObject);
        *ppvObject = nullptr;
        Schema& schema = m_object.GetSchema();
        // Data definitions live in the dictionary's own table, not as objects.
        if (id == kAAFClassID_DataDefinition) {
            DataDefinition* def = schema.Own(std::make_unique<DataDefinition>(schema, id, std::wstring()));
            return def->QueryInterface(riid, reinterpret_cast<void**>(ppvObject));
        }
        ClassDefinition* cls = schema.FindClass(id);
        Require(cls, AAFRESULT_OBJECT_NOT_FOUND);
        return cls->CreateInstance(riid, ppvObject);
    });
}

AAFRESULT DictionaryView::CreateMetaInstance(aafUID_constref id, REFIID riid, IUnknown** ppMetaDefinition) {
    return Guarded([&] {
        Require(ppMetaDefinition);
        *ppMetaDefinition = nullptr;
        Schema& schema = m_object.GetSchema();
        // A caller's own class: IAAFClassDef::Initialize names it and its parent.
        if (id == kAAFClassID_ClassDefinition) {
            ClassDefinition* cls =
                schema.Own(std::make_unique<ClassDefinition>(schema, id, std::wstring(), nullptr, false));
            return cls->QueryInterface(riid, reinterpret_cast<void**>(ppMetaDefinition));
        }
        if (id != kAAFClassID_TypeDefinitionRecord) throw static_cast<int>(AAFRESULT_NOT_IMPLEMENTED);
        auto* record = static_cast<TypeDefRecordType*>(
            schema.Own(std::make_unique<TypeDefRecordType>(schema, id, std::wstring())));
        return record->QueryInterface(riid, reinterpret_cast<void**>(ppMetaDefinition));
    });
}

AAFRESULT DictionaryView::RegisterClassDef(IAAFClassDef* pClassDef) {
    return Guarded([&] {
        ClassDefinition* def = Borrow<ClassDefinition>(pClassDef, kInternal_ClassDefinition);
        Require(def);
        m_object.GetSchema().Register(*def);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT DictionaryView::LookupClassDef(aafUID_constref classId, IAAFClassDef** ppClassDef) {
    return HandDefinition(m_object.GetSchema().FindClass(classId), AAFRESULT_OBJECT_NOT_FOUND, ppClassDef);
}

AAFRESULT DictionaryView::GetClassDefs(IEnumAAFClassDefs**) { return AAFRESULT_NOT_IMPLEMENTED; }

AAFRESULT DictionaryView::CountClassDefs(aafUInt32* pResult) {
    if (!pResult) return AAFRESULT_NULL_PARAM;
    *pResult = static_cast<aafUInt32>(m_object.GetSchema().Classes().size());
    return AAFRESULT_SUCCESS;
}

AAFRESULT DictionaryView::CreateForwardClassReference(aafUID_constref) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DictionaryView::HasForwardClassReference(aafUID_constref, aafBool* pResult) {
    if (!pResult) return AAFRESULT_NULL_PARAM;
    *pResult = kAAFFalse;
    return AAFRESULT_SUCCESS;
}

AAFRESULT DictionaryView::RegisterTypeDef(IAAFTypeDef* pTypeDef) {
    return Guarded([&] {
        TypeDefinition* def = Borrow<TypeDefinition>(pTypeDef, kInternal_TypeDefinition);
        Require(def);
        m_object.GetSchema().Register(*def);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT DictionaryView::LookupTypeDef(aafUID_constref typeId, IAAFTypeDef** ppTypeDef) {
    if (!ppTypeDef) return AAFRESULT_NULL_PARAM;
    TypeDefinition* def = m_object.GetSchema().FindType(typeId);
    if (!def) return AAFRESULT_OBJECT_NOT_FOUND;
    *ppTypeDef = def->Interface();
    (*ppTypeDef)->AddRef();
    return AAFRESULT_SUCCESS;
}

AAFRESULT DictionaryView::GetTypeDefs(IEnumAAFTypeDefs**) { return AAFRESULT_NOT_IMPLEMENTED; }

AAFRESULT DictionaryView::CountTypeDefs(aafUInt32* pResult) {
    if (!pResult) return AAFRESULT_NULL_PARAM;
    *pResult = static_cast<aafUInt32>(m_object.GetSchema().Types().size());
    return AAFRESULT_SUCCESS;
}

AAFRESULT DictionaryView::RegisterOpaqueTypeDef(IAAFTypeDef*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DictionaryView::LookupOpaqueTypeDef(aafUID_constref, IAAFTypeDef**) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DictionaryView::GetOpaqueTypeDefs(IEnumAAFTypeDefs**) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DictionaryView::CountOpaqueTypeDefs(aafUInt32*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DictionaryView::RegisterKLVDataKey(aafUID_t, IAAFTypeDef*) { return AAFRESULT_NOT_IMPLEMENTED; }

AAFRESULT DictionaryView::RegisterDataDef(IAAFDataDef* pDataDef) {
    return Guarded([&] {
        m_object.GetSchema().Register(DataDefArg(pDataDef));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT DictionaryView::LookupDataDef(aafUID_constref dataDefinitionId, IAAFDataDef** ppDataDef) {
    return HandDefinition(m_object.GetSchema().FindDataDef(dataDefinitionId), AAFRESULT_OBJECT_NOT_FOUND, ppDataDef);
}

AAFRESULT DictionaryView::GetDataDefs(IEnumAAFDataDefs**) { return AAFRESULT_NOT_IMPLEMENTED; }

AAFRESULT DictionaryView::CountDataDefs(aafUInt32* pResult) {
    if (!pResult) return AAFRESULT_NULL_PARAM;
    *pResult = static_cast<aafUInt32>(m_object.GetSchema().DataDefs().size());
    return AAFRESULT_SUCCESS;
}

// Effects, codecs, containers, interpolations and plug-ins have no place in
// this library: the plug-in never asks for them.
AAFRESULT DictionaryView::RegisterOperationDef(IAAFOperationDef*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DictionaryView::LookupOperationDef(aafUID_constref, IAAFOperationDef**) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DictionaryView::GetOperationDefs(IEnumAAFOperationDefs**) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DictionaryView::CountOperationDefs(aafUInt32*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DictionaryView::RegisterParameterDef(IAAFParameterDef*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DictionaryView::LookupParameterDef(aafUID_constref, IAAFParameterDef**) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DictionaryView::GetParameterDefs(IEnumAAFParameterDefs**) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DictionaryView::CountParameterDefs(aafUInt32*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DictionaryView::RegisterCodecDef(IAAFCodecDef*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DictionaryView::LookupCodecDef(aafUID_constref, IAAFCodecDef**) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DictionaryView::GetCodecDefs(IEnumAAFCodecDefs**) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DictionaryView::CountCodecDefs(aafUInt32*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DictionaryView::RegisterContainerDef(IAAFContainerDef*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DictionaryView::LookupContainerDef(aafUID_constref, IAAFContainerDef**) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DictionaryView::GetContainerDefs(IEnumAAFContainerDefs**) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DictionaryView::CountContainerDefs(aafUInt32*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DictionaryView::RegisterInterpolationDef(IAAFInterpolationDef*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DictionaryView::LookupInterpolationDef(aafUID_constref, IAAFInterpolationDef**) {
    return AAFRESULT_NOT_IMPLEMENTED;
}
AAFRESULT DictionaryView::GetInterpolationDefs(IEnumAAFInterpolationDefs**) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DictionaryView::CountInterpolationDefs(aafUInt32*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DictionaryView::RegisterPluginDef(IAAFPluginDef*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DictionaryView::LookupPluginDef(aafUID_constref, IAAFPluginDef**) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DictionaryView::GetPluginDefs(IEnumAAFPluginDefs**) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DictionaryView::CountPluginDefs(aafUInt32*) { return AAFRESULT_NOT_IMPLEMENTED; }

}  // namespace aafmodel
