#pragma once
/// Arrays of a fixed number of plain elements, as members of the identifier
/// records (the eight bytes of an AUID, the twelve of a UMID label).
#include "TypeDefFace.h"

namespace aafmodel {

class TypeDefFixedArrayType final : public TypeDefFace<IAAFTypeDef> {
public:
    TypeDefFixedArrayType(Schema& schema, const aafUID_t& id, std::wstring name, TypeDefinition& element, size_t count)
        : TypeDefFace(schema, id, std::move(name), kAAFTypeCatFixedArray), m_element(element), m_count(count) {}

    size_t NativeSize() const override { return m_element.NativeSize() * m_count; }
    size_t Alignment() const override { return m_element.Alignment(); }

private:
    TypeDefinition& m_element;
    size_t m_count;
};

}  // namespace aafmodel
