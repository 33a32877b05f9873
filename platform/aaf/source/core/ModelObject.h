#pragma once
/// An object of the model: an instance of a class definition holding typed
/// property values. Every interface of the object is a view over it; the
/// object counts the references of all its views. Objects held by strong
/// references know their container, so that one object sits in one place.
#include <cstring>
#include <memory>
#include <string>
#include <vector>

#include "RefPtr.h"
#include "Value.h"
#include "aaf/AAFCOM.h"

namespace aafmodel {

class ClassDefinition;
class PropertyDefinition;
class Schema;
class ViewBase;
struct ViewMaker;

class ModelObject {
public:
    struct Stored {
        PropertyDefinition* def;
        std::shared_ptr<Value> value;
    };

    explicit ModelObject(ClassDefinition& cls);
    ~ModelObject();
    ModelObject(const ModelObject&) = delete;
    ModelObject& operator=(const ModelObject&) = delete;

    /// Answers IUnknown and IAAFObject for every object, and the views of its
    /// class and its ancestors.
    AAFRESULT QueryInterface(const aafUID_t& iid, void** out);
    aafUInt32 AddRef() { return ++m_refs; }
    aafUInt32 Release();
    /// The object behind an interface pointer of this library, borrowed; null otherwise.
    static ModelObject* From(IUnknown* p);
    /// A counted interface of this object, or null when it does not answer `I`.
    template <class I>
    RefPtr<I> Query() {
        void* out = nullptr;
        if (AAFRESULT_FAILED(QueryInterface(AAFInterfaceID<I>::value, &out))) return RefPtr<I>();
        return RefPtr<I>::Adopt(static_cast<I*>(out));
    }

    ClassDefinition& Class() const { return m_class; }
    Schema& GetSchema() const;
    bool IsA(const aafUID_t& classId) const;

    /// Present properties, in the order of their definitions.
    const std::vector<Stored>& Properties() const { return m_properties; }
    Value* Find(const PropertyDefinition& def) const;
    std::shared_ptr<Value> FindShared(const PropertyDefinition& def) const;
    /// The property's value, made present and empty if it was absent.
    std::shared_ptr<Value> Ensure(const PropertyDefinition& def);
    /// Copies `value` into the property, taking its objects in; throws
    /// AAFRESULT_OBJECT_ALREADY_ATTACHED when one sits elsewhere.
    void Assign(const PropertyDefinition& def, const Value& value);
    void Remove(const PropertyDefinition& def);

    template <class T>
    void SetFixed(const PropertyDefinition& def, const T& v) {
        Value& value = *Ensure(def);
        const auto* bytes = reinterpret_cast<const aafUInt8*>(&v);
        value.data.assign(bytes, bytes + sizeof(T));
    }
    /// False when the property is absent.
    template <class T>
    bool GetFixed(const PropertyDefinition& def, T& out) const {
        const Value* value = Find(def);
        if (!value || value->data.size() != sizeof(T)) return false;
        std::memcpy(&out, value->data.data(), sizeof(T));
        return true;
    }
    /// Throws AAFRESULT_PROP_NOT_PRESENT when absent.
    template <class T>
    T GetRequired(const PropertyDefinition& def) const {
        T out{};
        if (!GetFixed(def, out)) throw static_cast<int>(AAFRESULT_PROP_NOT_PRESENT);
        return out;
    }
    void SetString(const PropertyDefinition& def, const std::wstring& text);
    bool GetString(const PropertyDefinition& def, std::wstring& out) const;
    void SetUInt32Array(const PropertyDefinition& def, const aafUInt32* values, aafUInt32 count);
    std::vector<aafUInt32> GetUInt32Array(const PropertyDefinition& def) const;

    /// The object of a strong reference property, or null.
    ModelObject* GetRef(const PropertyDefinition& def) const;
    /// Replaces the object of a strong reference property.
    void SetRef(const PropertyDefinition& def, ModelObject& child);
    /// The objects of a strong reference vector, or null when absent.
    const std::vector<RefPtr<ModelObject>>* FindVector(const PropertyDefinition& def) const;
    /// Inserts at `index` (the end when it equals the count); throws AAFRESULT_BADINDEX past it.
    void InsertInto(const PropertyDefinition& def, size_t index, ModelObject& child);
    /// Takes the element at `index` out; throws AAFRESULT_BADINDEX.
    RefPtr<ModelObject> RemoveFrom(const PropertyDefinition& def, size_t index);

    ModelObject* Container() const { return m_container; }
    /// Takes `child` into this object's tree; throws when it already sits
    /// somewhere or when this object lies inside `child`.
    void Attach(ModelObject& child);
    void Detach(ModelObject& child);
    /// Attaches or detaches through a value, if it belongs to an object.
    static void AttachThrough(Value& value, ModelObject& child);
    static void DetachThrough(Value& value, ModelObject& child);

    /// A lookup table that a view keeps beside this object (a Mob's slots by
    /// id); it goes with the object. Its user checks it against the schema's
    /// change count.
    struct Annex {
        virtual ~Annex() = default;
    };
    Annex* GetAnnex() const { return m_annex.get(); }
    void SetAnnex(std::unique_ptr<Annex> annex) const { m_annex = std::move(annex); }

    /// For the views' Initialize: throws AAFRESULT_ALREADY_INITIALIZED the second time.
    void MarkInitialized();
    bool Initialized() const { return m_initialized; }

private:
    Stored* FindStored(const PropertyDefinition& def);

    RefPtr<Schema> m_schema;  // first member: released last
    ClassDefinition& m_class;
    aafUInt32 m_refs = 0;
    bool m_initialized = false;
    ModelObject* m_container = nullptr;
    std::vector<Stored> m_properties;
    std::vector<std::pair<const ViewMaker*, std::unique_ptr<ViewBase>>> m_views;
    mutable std::unique_ptr<Annex> m_annex;
};

}  // namespace aafmodel
