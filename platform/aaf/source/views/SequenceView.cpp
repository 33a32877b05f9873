#include "SequenceView.h"

#include "../core/DataDefinition.h"
#include "../core/Enumerator.h"
#include "../core/Schema.h"
#include "ViewSupport.h"
#include "aaf/IAAFComponent.h"
#include "aaf/IEnumAAFComponents.h"

namespace aafmodel {

namespace {
// A sequence is as long as its components together; events, which stand at
// positions, carry no length and add nothing.
void UpdateLength(ModelObject& sequence) {
    const BuiltinDefinitions& b = Builtins(sequence);
    aafLength_t total = 0;
    if (const auto* components = sequence.FindVector(*b.p.sequenceComponents))
        for (const auto& c : *components) {
            aafLength_t length = 0;
            if (c->GetFixed(*b.p.componentLength, length)) total += length;
        }
    sequence.SetFixed(*b.p.componentLength, total);
}
}  // namespace

AAFRESULT SequenceView::Initialize(IAAFDataDef* pDataDef) {
    return Guarded([&] {
        DataDefinition& def = DataDefArg(pDataDef);
        m_object.MarkInitialized();
        SetDataDefinition(m_object, def);
        m_object.Ensure(*Builtins(m_object).p.sequenceComponents);
        UpdateLength(m_object);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT SequenceView::AppendComponent(IAAFComponent* pComponent) {
    aafUInt32 count = 0;
    CountComponents(&count);
    return InsertComponentAt(count, pComponent);
}

AAFRESULT SequenceView::PrependComponent(IAAFComponent* pComponent) { return InsertComponentAt(0, pComponent); }

// A component must carry the sequence's kind of data, when both name one.
AAFRESULT SequenceView::InsertComponentAt(aafUInt32 index, IAAFComponent* pComponent) {
    return Guarded([&] {
        const BuiltinDefinitions& b = Builtins(m_object);
        ModelObject& component = ObjectArg(pComponent, *b.c.component);
        aafUID_t mine, theirs;
        if (m_object.GetFixed(*b.p.componentDataDefinition, mine) &&
            component.GetFixed(*b.p.componentDataDefinition, theirs) && mine != theirs)
            throw static_cast<int>(AAFRESULT_INVALID_DATADEF);
        m_object.InsertInto(*b.p.sequenceComponents, index, component);
        UpdateLength(m_object);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT SequenceView::GetComponentAt(aafUInt32 index, IAAFComponent** ppComponent) {
    return Guarded([&] {
        const auto* components = m_object.FindVector(*Builtins(m_object).p.sequenceComponents);
        if (!components || index >= components->size()) throw static_cast<int>(AAFRESULT_BADINDEX);
        return HandOut(*(*components)[index], ppComponent);
    });
}

AAFRESULT SequenceView::RemoveComponentAt(aafUInt32 index) {
    return Guarded([&] {
        m_object.RemoveFrom(*Builtins(m_object).p.sequenceComponents, index);
        UpdateLength(m_object);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT SequenceView::CountComponents(aafUInt32* pResult) {
    if (!pResult) return AAFRESULT_NULL_PARAM;
    const auto* components = m_object.FindVector(*Builtins(m_object).p.sequenceComponents);
    *pResult = components ? static_cast<aafUInt32>(components->size()) : 0;
    return AAFRESULT_SUCCESS;
}

AAFRESULT SequenceView::GetComponents(IEnumAAFComponents** ppEnum) {
    return Guarded([&] {
        Require(ppEnum);
        std::vector<RefPtr<IAAFComponent>> items;
        if (const auto* components = m_object.FindVector(*Builtins(m_object).p.sequenceComponents))
            for (const auto& c : *components) items.push_back(c->Query<IAAFComponent>());
        *ppEnum = new Enumerator<IEnumAAFComponents, IAAFComponent>(std::move(items));
        (*ppEnum)->AddRef();
        return AAFRESULT_SUCCESS;
    });
}

}  // namespace aafmodel
