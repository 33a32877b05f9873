#include "TaggedValueView.h"

#include <cstring>

#include "../core/InternalIDs.h"
#include "../core/Schema.h"
#include "../core/TypeDefIndirectType.h"
#include "../core/WideText.h"
#include "ViewSupport.h"

namespace aafmodel {

namespace {
const Value& Stored(const ModelObject& tagged) {
    const Value* value = tagged.Find(*Builtins(tagged).p.taggedValueValue);
    if (!value || !value->actual) throw static_cast<int>(AAFRESULT_PROP_NOT_PRESENT);
    return *value;
}
}  // namespace

AAFRESULT TaggedValueView::Initialize(aafCharacter_constptr pName, IAAFTypeDef* pTypeDef, aafUInt32 valueSize,
                                      aafDataBuffer_t pValue) {
    return Guarded([&] {
        const std::wstring name = WideArg(pName);
        Require(pValue || valueSize == 0);
        TypeDefinition* type = Borrow<TypeDefinition>(pTypeDef, kInternal_TypeDefinition);
        Require(type);
        const BuiltinDefinitions& b = Builtins(m_object);
        Value value = static_cast<TypeDefIndirectType*>(b.t.indirect)->Wrap(*type, pValue, valueSize);
        m_object.MarkInitialized();
        m_object.SetString(*b.p.taggedValueName, name);
        m_object.Assign(*b.p.taggedValueValue, value);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TaggedValueView::GetName(aafCharacter* pName, aafUInt32 bufSize) {
    return Guarded([&] {
        CopyStringProperty(m_object, *Builtins(m_object).p.taggedValueName, pName, bufSize);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TaggedValueView::GetNameBufLen(aafUInt32* pLen) {
    return Guarded([&] {
        Require(pLen);
        *pLen = StringPropertyBufLen(m_object, *Builtins(m_object).p.taggedValueName);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TaggedValueView::GetTypeDefinition(IAAFTypeDef** ppTypeDef) {
    return Guarded([&] {
        Require(ppTypeDef);
        *ppTypeDef = Stored(m_object).actual->Interface();
        (*ppTypeDef)->AddRef();
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TaggedValueView::GetValue(aafUInt32 valueSize, aafDataBuffer_t pValue, aafUInt32* bytesRead) {
    return Guarded([&] {
        Require(pValue);
        Require(bytesRead);
        const Value& value = Stored(m_object);
        if (valueSize < value.data.size()) throw static_cast<int>(AAFRESULT_SMALLBUF);
        if (!value.data.empty()) std::memcpy(pValue, value.data.data(), value.data.size());
        *bytesRead = static_cast<aafUInt32>(value.data.size());
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TaggedValueView::GetValueBufLen(aafUInt32* pLen) {
    return Guarded([&] {
        Require(pLen);
        *pLen = static_cast<aafUInt32>(Stored(m_object).data.size());
        return AAFRESULT_SUCCESS;
    });
}

// The value keeps its type; only its data changes.
AAFRESULT TaggedValueView::SetValue(aafUInt32 valueSize, aafDataBuffer_t pValue) {
    return Guarded([&] {
        Require(pValue || valueSize == 0);
        const BuiltinDefinitions& b = Builtins(m_object);
        TypeDefinition& type = *Stored(m_object).actual;
        m_object.Assign(*b.p.taggedValueValue,
                        static_cast<TypeDefIndirectType*>(b.t.indirect)->Wrap(type, pValue, valueSize));
        return AAFRESULT_SUCCESS;
    });
}

}  // namespace aafmodel
