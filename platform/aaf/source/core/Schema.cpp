#include "Schema.h"

#include <mutex>

#include "BuiltinSchema.h"
#include "ClassDefinition.h"
#include "DataDefinition.h"
#include "Guard.h"
#include "PropertyDefinition.h"
#include "TypeDefinition.h"

namespace aafmodel {

// Room for the built-in definitions and a few registered at run time, so
// that making a file does not grow the tables step by step.
Schema::Schema() {
    m_classes.reserve(48);
    m_types.reserve(64);
    m_dataDefs.reserve(8);
    m_properties.reserve(128);
    m_classById.reserve(48);
    m_typeById.reserve(64);
    m_dataDefById.reserve(8);
    m_classOrder.reserve(48);
    m_typeOrder.reserve(64);
    m_dataDefOrder.reserve(8);
}
Schema::~Schema() = default;

namespace {

// Schemas whose files have gone, as new, for the next files: making the
// built-in definitions is most of the cost of opening a transient file.
// Never destroyed, so that a file released late in the process's exit still
// finds it.
class IdleSchemas {
public:
    static IdleSchemas& Get() {
        static auto* pool = new IdleSchemas();
        return *pool;
    }
    Schema* Take() {
        std::lock_guard<std::mutex> lock(m_mutex);
        if (m_idle.empty()) return nullptr;
        Schema* schema = m_idle.back();
        m_idle.pop_back();
        return schema;
    }
    /// False when the pool is full.
    bool Keep(Schema* schema) {
        std::lock_guard<std::mutex> lock(m_mutex);
        if (m_idle.size() >= kKept) return false;
        m_idle.push_back(schema);
        return true;
    }

private:
    // A host works on a few clips at a time.
    static constexpr size_t kKept = 4;
    std::mutex m_mutex;
    std::vector<Schema*> m_idle;
};

}  // namespace

Schema* Schema::Create() {
    Schema* schema = IdleSchemas::Get().Take();
    if (!schema) {
        schema = new Schema();
        try {
            BuildBuiltinSchema(*schema);
        } catch (...) {
            delete schema;
            throw;
        }
        schema->m_builtinExtent = schema->Current();
    }
    schema->AddRef();
    return schema;
}

aafUInt32 Schema::Release() {
    const aafUInt32 left = --m_refs;
    if (left == 0 && !(ResetToBuiltins() && IdleSchemas::Get().Keep(this))) delete this;
    return left;
}

Schema::Extent Schema::Current() const {
    return Extent{m_classes.size(),    m_types.size(),     m_dataDefs.size(),     m_properties.size(),
                  m_classOrder.size(), m_typeOrder.size(), m_dataDefOrder.size(), m_nextSerial};
}

bool Schema::IsBuiltIn(const TypeDefinition& def) const {
    for (size_t i = 0; i < m_builtinExtent.types; ++i)
        if (m_types[i].get() == &def) return true;
    return false;
}

bool Schema::ResetToBuiltins() {
    if (!m_reusable) return false;
    // Newest first, so that each leaves its class as the class's last property.
    for (size_t i = m_properties.size(); i-- > m_builtinExtent.properties;)
        m_properties[i]->Owner().DropLastProperty(*m_properties[i]);
    for (size_t i = m_builtinExtent.classOrder; i < m_classOrder.size(); ++i) m_classById.erase(m_classOrder[i]->Id());
    for (size_t i = m_builtinExtent.typeOrder; i < m_typeOrder.size(); ++i) m_typeById.erase(m_typeOrder[i]->Id());
    for (size_t i = m_builtinExtent.dataDefOrder; i < m_dataDefOrder.size(); ++i)
        m_dataDefById.erase(m_dataDefOrder[i]->Id());
    m_classOrder.resize(m_builtinExtent.classOrder);
    m_typeOrder.resize(m_builtinExtent.typeOrder);
    m_dataDefOrder.resize(m_builtinExtent.dataDefOrder);
    m_properties.resize(m_builtinExtent.properties);
    m_classes.resize(m_builtinExtent.classes);
    m_types.resize(m_builtinExtent.types);
    m_dataDefs.resize(m_builtinExtent.dataDefs);
    m_nextSerial = m_builtinExtent.serial;
    return true;
}

ClassDefinition* Schema::Own(std::unique_ptr<ClassDefinition> def) {
    m_classes.push_back(std::move(def));
    return m_classes.back().get();
}
TypeDefinition* Schema::Own(std::unique_ptr<TypeDefinition> def) {
    m_types.push_back(std::move(def));
    return m_types.back().get();
}
DataDefinition* Schema::Own(std::unique_ptr<DataDefinition> def) {
    m_dataDefs.push_back(std::move(def));
    return m_dataDefs.back().get();
}
PropertyDefinition* Schema::Own(std::unique_ptr<PropertyDefinition> def) {
    m_properties.push_back(std::move(def));
    return m_properties.back().get();
}

namespace {
template <class Map, class Def>
void Enter(Map& map, std::vector<Def*>& order, Def& def) {
    if (!def.Defined()) throw static_cast<int>(AAFRESULT_NOT_INITIALIZED);
    if (!map.emplace(def.Id(), &def).second) throw static_cast<int>(AAFRESULT_TABLE_DUP_KEY);
    order.push_back(&def);
}
template <class Map>
auto Find(const Map& map, const aafUID_t& id) -> typename Map::mapped_type {
    auto it = map.find(id);
    return it == map.end() ? nullptr : it->second;
}
}  // namespace

void Schema::Register(ClassDefinition& def) { Enter(m_classById, m_classOrder, def); }
void Schema::Register(TypeDefinition& def) { Enter(m_typeById, m_typeOrder, def); }
void Schema::Register(DataDefinition& def) { Enter(m_dataDefById, m_dataDefOrder, def); }

ClassDefinition* Schema::FindClass(const aafUID_t& id) const { return Find(m_classById, id); }
TypeDefinition* Schema::FindType(const aafUID_t& id) const { return Find(m_typeById, id); }
DataDefinition* Schema::FindDataDef(const aafUID_t& id) const { return Find(m_dataDefById, id); }

}  // namespace aafmodel
