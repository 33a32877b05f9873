#include "TaggedValueList.h"

#include "../core/Enumerator.h"
#include "../core/Schema.h"
#include "../core/TypeDefIndirectType.h"
#include "ViewSupport.h"
#include "aaf/IEnumAAFTaggedValues.h"

namespace aafmodel {

void AppendTaggedString(ModelObject& owner, const PropertyDefinition& list, aafCharacter_constptr name,
                        aafCharacter_constptr value) {
    Require(name);
    Require(value);
    const BuiltinDefinitions& b = Builtins(owner);
    RefPtr<ModelObject> tagged = NewObject(*b.c.taggedValue);
    tagged->SetString(*b.p.taggedValueName, name);
    const std::wstring text(value);
    auto* indirect = static_cast<TypeDefIndirectType*>(b.t.indirect);
    tagged->Assign(*b.p.taggedValueValue, indirect->Wrap(*b.t.string, reinterpret_cast<const aafUInt8*>(text.c_str()),
                                                         (text.size() + 1) * sizeof(aafCharacter)));
    const auto* existing = owner.FindVector(list);
    owner.InsertInto(list, existing ? existing->size() : 0, *tagged);
}

aafUInt32 CountTagged(const ModelObject& owner, const PropertyDefinition& list) {
    const auto* values = owner.FindVector(list);
    return values ? static_cast<aafUInt32>(values->size()) : 0;
}

IEnumAAFTaggedValues* EnumerateTagged(const ModelObject& owner, const PropertyDefinition& list) {
    std::vector<RefPtr<IAAFTaggedValue>> items;
    if (const auto* values = owner.FindVector(list))
        for (const auto& v : *values) items.push_back(v->Query<IAAFTaggedValue>());
    auto* e = new Enumerator<IEnumAAFTaggedValues, IAAFTaggedValue>(std::move(items));
    e->AddRef();
    return e;
}

void RemoveTagged(ModelObject& owner, const PropertyDefinition& list, IAAFTaggedValue* pValue) {
    ModelObject& target = ObjectArg(pValue, *Builtins(owner).c.taggedValue);
    if (const auto* values = owner.FindVector(list))
        for (size_t i = 0; i < values->size(); ++i)
            if ((*values)[i].get() == &target) {
                owner.RemoveFrom(list, i);
                return;
            }
    throw static_cast<int>(AAFRESULT_OBJECT_NOT_FOUND);
}

}  // namespace aafmodel
