#pragma once
/// The interface face shared by every kind of type: reference counting that
/// goes to the schema, the queries, and IAAFTypeDef. `Face` is the kind's
/// interface; `Also` lists the further interfaces that it derives from and
/// answers (IAAFTypeDefObjectRef for the references).
#include "Guard.h"
#include "InternalIDs.h"
#include "TypeDefinition.h"

namespace aafmodel {

template <class Face, class... Also>
class TypeDefFace : public Face, public TypeDefinition {
public:
    using TypeDefinition::TypeDefinition;

    AAFRESULT QueryInterface(REFIID riid, void** ppvObj) override {
        if (!ppvObj) return AAFRESULT_NULL_PARAM;
        *ppvObj = nullptr;
        if (riid == IID_IUnknown || riid == IID_IAAFTypeDef)
            *ppvObj = static_cast<IAAFTypeDef*>(static_cast<Face*>(this));
        else if (riid == AAFInterfaceID<Face>::value)
            *ppvObj = static_cast<Face*>(this);
        else if (riid == IID_IAAFMetaDefinition)
            *ppvObj = static_cast<IAAFMetaDefinition*>(this);
        else if (riid == kInternal_TypeDefinition)
            *ppvObj = static_cast<TypeDefinition*>(this);
        else
            (void)((riid == AAFInterfaceID<Also>::value ? (*ppvObj = static_cast<Also*>(this), true) : false) || ...);
        if (!*ppvObj) return AAF_E_NOINTERFACE;
        AddRef();
        return AAFRESULT_SUCCESS;
    }
    aafUInt32 AddRef() override { return MetaDefinitionBase::AddRef(); }
    aafUInt32 Release() override { return MetaDefinitionBase::Release(); }

    AAFRESULT GetTypeCategory(eAAFTypeCategory_t* pTid) override {
        if (!pTid) return AAFRESULT_NULL_PARAM;
        *pTid = Category();
        return AAFRESULT_SUCCESS;
    }
    AAFRESULT RawAccessType(IAAFTypeDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }

    IAAFTypeDef* Interface() override { return static_cast<Face*>(this); }
};

}  // namespace aafmodel
