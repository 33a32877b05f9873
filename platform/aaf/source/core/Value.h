#pragma once
/// The stored form of one typed value: plain data in the in-memory layout of
/// its type, or the objects it references.
#include <vector>

#include "RefPtr.h"
#include "aaf/AAFTypes.h"

namespace aafmodel {

class ModelObject;
class TypeDefinition;

struct Value {
    // Defined where ModelObject is complete, so that any file may hold values.
    Value();
    ~Value();
    Value(const Value&);
    Value(Value&&) noexcept;
    Value& operator=(const Value&);
    Value& operator=(Value&&) noexcept;

    /// The declared type; for an indirect value, the indirect type.
    TypeDefinition* type = nullptr;
    /// For an indirect value, the type that `data` is of.
    TypeDefinition* actual = nullptr;
    /// Integers, records, strings (with their null) and data arrays.
    std::vector<aafUInt8> data;
    /// Strong references: one for a single reference, any number for a vector.
    std::vector<RefPtr<ModelObject>> objects;
    /// The object whose property this value is, or null for a free value.
    ModelObject* owner = nullptr;
};

}  // namespace aafmodel
