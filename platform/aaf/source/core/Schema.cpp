#include "Schema.h"

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

Schema* Schema::Create() {
    auto* schema = new Schema();
    schema->AddRef();
    try {
        BuildBuiltinSchema(*schema);
    } catch (...) {
        schema->Release();
        throw;
    }
    return schema;
}

aafUInt32 Schema::Release() {
    const aafUInt32 left = --m_refs;
    if (left == 0) delete this;
    return left;
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
