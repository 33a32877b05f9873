#include "ModelObject.h"

#include <algorithm>
#include <cstring>

#include "ClassDefinition.h"
#include "Guard.h"
#include "InternalIDs.h"
#include "PropertyDefinition.h"
#include "Schema.h"
#include "TypeDefinition.h"
#include "ViewBase.h"

namespace aafmodel {

ModelObject::ModelObject(ClassDefinition& cls) : m_schema(&cls.GetSchema()), m_class(cls) {}

ModelObject::~ModelObject() {
    // Children outlive us only through references of their own; they no
    // longer sit anywhere.
    for (Stored& stored : m_properties) {
        stored.value->owner = nullptr;
        for (auto& child : stored.value->objects) child->m_container = nullptr;
    }
}

Schema& ModelObject::GetSchema() const { return *m_schema; }

aafUInt32 ModelObject::Release() {
    const aafUInt32 left = --m_refs;
    if (left == 0) delete this;
    return left;
}

AAFRESULT ModelObject::QueryInterface(const aafUID_t& iid, void** out) {
    if (!out) return AAFRESULT_NULL_PARAM;
    *out = nullptr;
    if (iid == kInternal_ModelObject) {
        *out = this;
        AddRef();
        return AAFRESULT_SUCCESS;
    }
    // IUnknown is the IAAFObject face, which the root class provides.
    const aafUID_t& wanted = iid == IID_IUnknown ? IID_IAAFObject : iid;
    for (const ClassDefinition* c = &m_class; c; c = c->Parent()) {
        for (const ViewMaker* maker : c->Views()) {
            if (!maker->answers(wanted)) continue;
            auto it = std::find_if(m_views.begin(), m_views.end(), [&](const auto& v) { return v.first == maker; });
            if (it == m_views.end()) {
                try {
                    m_views.emplace_back(maker, std::unique_ptr<ViewBase>(maker->make(*this)));
                } catch (...) {
                    return AAFRESULT_NOMEMORY;
                }
                it = m_views.end() - 1;
            }
            *out = it->second->As(wanted);
            AddRef();
            return AAFRESULT_SUCCESS;
        }
    }
    return AAF_E_NOINTERFACE;
}

ModelObject* ModelObject::From(IUnknown* p) { return Borrow<ModelObject>(p, kInternal_ModelObject); }

bool ModelObject::IsA(const aafUID_t& classId) const {
    for (const ClassDefinition* c = &m_class; c; c = c->Parent())
        if (c->Id() == classId) return true;
    return false;
}

ModelObject::Stored* ModelObject::FindStored(const PropertyDefinition& def) {
    for (Stored& s : m_properties)
        if (s.def == &def) return &s;
    return nullptr;
}

Value* ModelObject::Find(const PropertyDefinition& def) const {
    for (const Stored& s : m_properties)
        if (s.def == &def) return s.value.get();
    return nullptr;
}

std::shared_ptr<Value> ModelObject::FindShared(const PropertyDefinition& def) const {
    for (const Stored& s : m_properties)
        if (s.def == &def) return s.value;
    return nullptr;
}

std::shared_ptr<Value> ModelObject::Ensure(const PropertyDefinition& def) {
    if (Stored* s = FindStored(def)) return s->value;
    auto value = std::make_shared<Value>(def.Type().EmptyValue());
    value->owner = this;
    auto at = std::find_if(m_properties.begin(), m_properties.end(),
                           [&](const Stored& s) { return s.def->Serial() > def.Serial(); });
    m_properties.insert(at, Stored{const_cast<PropertyDefinition*>(&def), value});
    return value;
}

void ModelObject::Assign(const PropertyDefinition& def, const Value& value) {
    std::shared_ptr<Value> target = Ensure(def);
    // Check every newcomer before anything changes.
    for (const auto& child : value.objects) {
        const bool alreadyHere = std::any_of(target->objects.begin(), target->objects.end(),
                                             [&](const auto& o) { return o.get() == child.get(); });
        if (!alreadyHere && child->m_container) throw static_cast<int>(AAFRESULT_OBJECT_ALREADY_ATTACHED);
    }
    for (auto& old : target->objects) Detach(*old);
    for (const auto& child : value.objects) Attach(*child);
    target->type = value.type;
    target->actual = value.actual;
    target->data = value.data;
    target->objects = value.objects;
}

void ModelObject::Remove(const PropertyDefinition& def) {
    auto it = std::find_if(m_properties.begin(), m_properties.end(), [&](const Stored& s) { return s.def == &def; });
    if (it == m_properties.end()) return;
    m_schema->NoteChange();
    for (auto& child : it->value->objects) Detach(*child);
    it->value->owner = nullptr;
    m_properties.erase(it);
}

void ModelObject::SetString(const PropertyDefinition& def, const std::wstring& text) {
    Value& value = *Ensure(def);
    const auto* bytes = reinterpret_cast<const aafUInt8*>(text.c_str());
    value.data.assign(bytes, bytes + (text.size() + 1) * sizeof(aafCharacter));
}

bool ModelObject::GetString(const PropertyDefinition& def, std::wstring& out) const {
    const Value* value = Find(def);
    if (!value) return false;
    const size_t chars = value->data.size() / sizeof(aafCharacter);
    out.assign(reinterpret_cast<const aafCharacter*>(value->data.data()), chars);
    out.resize(std::wcslen(out.c_str()));
    return true;
}

void ModelObject::SetUInt32Array(const PropertyDefinition& def, const aafUInt32* values, aafUInt32 count) {
    Value& value = *Ensure(def);
    const auto* bytes = reinterpret_cast<const aafUInt8*>(values);
    value.data.assign(bytes, bytes + count * sizeof(aafUInt32));
}

std::vector<aafUInt32> ModelObject::GetUInt32Array(const PropertyDefinition& def) const {
    std::vector<aafUInt32> out;
    if (const Value* value = Find(def)) {
        out.resize(value->data.size() / sizeof(aafUInt32));
        if (!out.empty()) std::memcpy(out.data(), value->data.data(), out.size() * sizeof(aafUInt32));
    }
    return out;
}

ModelObject* ModelObject::GetRef(const PropertyDefinition& def) const {
    const Value* value = Find(def);
    return value && !value->objects.empty() ? value->objects.front().get() : nullptr;
}

void ModelObject::SetRef(const PropertyDefinition& def, ModelObject& child) {
    Value value;
    value.type = &def.Type();
    value.objects.emplace_back(&child);
    Assign(def, value);
}

const std::vector<RefPtr<ModelObject>>* ModelObject::FindVector(const PropertyDefinition& def) const {
    const Value* value = Find(def);
    return value ? &value->objects : nullptr;
}

void ModelObject::InsertInto(const PropertyDefinition& def, size_t index, ModelObject& child) {
    std::shared_ptr<Value> value = Ensure(def);
    if (index > value->objects.size()) throw static_cast<int>(AAFRESULT_BADINDEX);
    Attach(child);
    // Appending is the one change that lookup tables follow by themselves.
    if (index != value->objects.size()) m_schema->NoteChange();
    value->objects.insert(value->objects.begin() + static_cast<std::ptrdiff_t>(index), RefPtr<ModelObject>(&child));
}

RefPtr<ModelObject> ModelObject::RemoveFrom(const PropertyDefinition& def, size_t index) {
    Value* value = Find(def);
    if (!value || index >= value->objects.size()) throw static_cast<int>(AAFRESULT_BADINDEX);
    m_schema->NoteChange();
    RefPtr<ModelObject> child = value->objects[index];
    value->objects.erase(value->objects.begin() + static_cast<std::ptrdiff_t>(index));
    Detach(*child);
    return child;
}

void ModelObject::Attach(ModelObject& child) {
    if (child.m_container) throw static_cast<int>(AAFRESULT_OBJECT_ALREADY_ATTACHED);
    for (ModelObject* up = this; up; up = up->m_container)
        if (up == &child) throw static_cast<int>(AAFRESULT_INVALID_PARAM);
    child.m_container = this;
}

void ModelObject::Detach(ModelObject& child) {
    if (child.m_container == this) child.m_container = nullptr;
}

void ModelObject::AttachThrough(Value& value, ModelObject& child) {
    if (value.owner) value.owner->Attach(child);
}

void ModelObject::DetachThrough(Value& value, ModelObject& child) {
    if (value.owner) value.owner->Detach(child);
}

void ModelObject::MarkInitialized() {
    if (m_initialized) throw static_cast<int>(AAFRESULT_ALREADY_INITIALIZED);
    m_initialized = true;
}

}  // namespace aafmodel
