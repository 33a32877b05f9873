#pragma once
/// The definitions of one file: classes, properties, types and data
/// definitions, built-in and registered at run time. The schema owns every
/// definition; a reference to any definition, and every object of the file,
/// holds a reference to the schema, so definitions stay valid while anything
/// of the file is alive.
#include <memory>
#include <unordered_map>
#include <vector>

#include "BuiltinDefinitions.h"
#include "UIDHash.h"
#include "aaf/AAFTypes.h"

namespace aafmodel {

class ClassDefinition;
class DataDefinition;
class PropertyDefinition;
class TypeDefinition;

class Schema {
public:
    /// A schema with the built-in definitions, and one reference for the caller.
    static Schema* Create();

    aafUInt32 AddRef() { return ++m_refs; }
    /// The last release gives the schema back to the pool of idle ones when
    /// it can be made as new again; otherwise it is deleted.
    aafUInt32 Release();

    /// A definition changed in place (a new name or description, a record's
    /// new layout): this schema cannot be made as new again.
    void NoteChangedInPlace() { m_reusable = false; }
    /// True for a type made with the schema, not registered later.
    bool IsBuiltIn(const TypeDefinition& def) const;

    /// Takes ownership of a definition; it is not yet registered.
    ClassDefinition* Own(std::unique_ptr<ClassDefinition> def);
    TypeDefinition* Own(std::unique_ptr<TypeDefinition> def);
    DataDefinition* Own(std::unique_ptr<DataDefinition> def);
    PropertyDefinition* Own(std::unique_ptr<PropertyDefinition> def);

    /// Makes a definition findable by its id; throws AAFRESULT_TABLE_DUP_KEY
    /// when the id is taken, AAFRESULT_NOT_INITIALIZED for an undefined one.
    void Register(ClassDefinition& def);
    void Register(TypeDefinition& def);
    void Register(DataDefinition& def);

    ClassDefinition* FindClass(const aafUID_t& id) const;
    TypeDefinition* FindType(const aafUID_t& id) const;
    DataDefinition* FindDataDef(const aafUID_t& id) const;

    const std::vector<ClassDefinition*>& Classes() const { return m_classOrder; }
    const std::vector<TypeDefinition*>& Types() const { return m_typeOrder; }
    const std::vector<DataDefinition*>& DataDefs() const { return m_dataDefOrder; }

    /// The built-in definitions, for the views' direct use.
    const BuiltinDefinitions& B() const { return m_builtins; }
    BuiltinDefinitions& MutableBuiltins() { return m_builtins; }

    /// Numbers property definitions in the order they were made, which is the
    /// order in which an object lists its properties.
    aafUInt32 NextPropertySerial() { return m_nextSerial++; }

    /// Counts the changes to this file's objects that a lookup table kept
    /// beside an object cannot follow: removals, insertions before the end,
    /// every value reached through the generic interfaces, a slot's new id.
    /// A table made at another count is made again.
    aafUInt64 ChangeCount() const { return m_changes; }
    void NoteChange() { ++m_changes; }

private:
    Schema();
    ~Schema();

    /// Drops what was registered since the built-in definitions were made,
    /// properties added to built-in classes included. False, and nothing
    /// dropped, when a definition changed in place.
    bool ResetToBuiltins();

    /// How far the tables reached when the built-in definitions were complete.
    struct Extent {
        size_t classes = 0, types = 0, dataDefs = 0, properties = 0;
        size_t classOrder = 0, typeOrder = 0, dataDefOrder = 0;
        aafUInt32 serial = 0;
    };
    Extent Current() const;

    aafUInt32 m_refs = 0;
    aafUInt32 m_nextSerial = 0;
    aafUInt64 m_changes = 0;
    bool m_reusable = true;
    Extent m_builtinExtent;
    std::vector<std::unique_ptr<ClassDefinition>> m_classes;
    std::vector<std::unique_ptr<TypeDefinition>> m_types;
    std::vector<std::unique_ptr<DataDefinition>> m_dataDefs;
    std::vector<std::unique_ptr<PropertyDefinition>> m_properties;
    std::unordered_map<aafUID_t, ClassDefinition*, UIDHash> m_classById;
    std::unordered_map<aafUID_t, TypeDefinition*, UIDHash> m_typeById;
    std::unordered_map<aafUID_t, DataDefinition*, UIDHash> m_dataDefById;
    std::vector<ClassDefinition*> m_classOrder;
    std::vector<TypeDefinition*> m_typeOrder;
    std::vector<DataDefinition*> m_dataDefOrder;
    BuiltinDefinitions m_builtins;
};

}  // namespace aafmodel
