#include "ComponentView.h"

#include "../core/DataDefinition.h"
#include "../core/Schema.h"
#include "TaggedValueList.h"
#include "ViewSupport.h"

namespace aafmodel {

AAFRESULT ComponentView::SetLength(aafLength_constref length) {
    return Guarded([&] {
        m_object.SetFixed(*Builtins(m_object).p.componentLength, length);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT ComponentView::GetLength(aafLength_t* pLength) {
    return Guarded([&] {
        Require(pLength);
        *pLength = m_object.GetRequired<aafLength_t>(*Builtins(m_object).p.componentLength);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT ComponentView::SetDataDef(IAAFDataDef* pDataDef) {
    return Guarded([&] {
        SetDataDefinition(m_object, DataDefArg(pDataDef));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT ComponentView::GetDataDef(IAAFDataDef** ppDatadef) {
    return Guarded([&] {
        Require(ppDatadef);
        DataDefinition& def = GetDataDefinition(m_object);
        *ppDatadef = &def;
        def.AddRef();
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT ComponentView::AppendKLVData(IAAFKLVData*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT ComponentView::CountKLVData(aafUInt32* pNumData) {
    if (!pNumData) return AAFRESULT_NULL_PARAM;
    *pNumData = 0;
    return AAFRESULT_SUCCESS;
}
AAFRESULT ComponentView::GetKLVData(IEnumAAFKLVData**) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT ComponentView::RemoveKLVData(IAAFKLVData*) { return AAFRESULT_NOT_IMPLEMENTED; }

AAFRESULT ComponentView::AppendComment(aafCharacter_constptr pName, aafCharacter_constptr pValue) {
    return Guarded([&] {
        AppendTaggedString(m_object, *Builtins(m_object).p.componentUserComments, pName, pValue);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT ComponentView::CountComments(aafUInt32* pNumComments) {
    if (!pNumComments) return AAFRESULT_NULL_PARAM;
    *pNumComments = CountTagged(m_object, *Builtins(m_object).p.componentUserComments);
    return AAFRESULT_SUCCESS;
}

AAFRESULT ComponentView::GetComments(IEnumAAFTaggedValues** ppEnum) {
    return Guarded([&] {
        Require(ppEnum);
        *ppEnum = EnumerateTagged(m_object, *Builtins(m_object).p.componentUserComments);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT ComponentView::RemoveComment(IAAFTaggedValue* pComment) {
    return Guarded([&] {
        RemoveTagged(m_object, *Builtins(m_object).p.componentUserComments, pComment);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT ComponentView::AppendAttribute(aafCharacter_constptr pName, aafCharacter_constptr pValue) {
    return Guarded([&] {
        AppendTaggedString(m_object, *Builtins(m_object).p.componentAttributes, pName, pValue);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT ComponentView::CountAttributes(aafUInt32* pNumAttributes) {
    if (!pNumAttributes) return AAFRESULT_NULL_PARAM;
    *pNumAttributes = CountTagged(m_object, *Builtins(m_object).p.componentAttributes);
    return AAFRESULT_SUCCESS;
}

AAFRESULT ComponentView::GetAttributes(IEnumAAFTaggedValues** ppEnum) {
    return Guarded([&] {
        Require(ppEnum);
        *ppEnum = EnumerateTagged(m_object, *Builtins(m_object).p.componentAttributes);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT ComponentView::RemoveAttribute(IAAFTaggedValue* pAttribute) {
    return Guarded([&] {
        RemoveTagged(m_object, *Builtins(m_object).p.componentAttributes, pAttribute);
        return AAFRESULT_SUCCESS;
    });
}

}  // namespace aafmodel
