#pragma once
/// What the library knows of every type: its category and the in-memory size
/// of its values. The interface faces live in TypeDefFace and the kinds.
#include "MetaDefinitionBase.h"
#include "Value.h"
#include "aaf/IAAFTypeDef.h"

namespace aafmodel {

class PropertyValue;

class TypeDefinition : public MetaDefinitionBase {
public:
    TypeDefinition(Schema& schema, const aafUID_t& id, std::wstring name, eAAFTypeCategory_t category);

    eAAFTypeCategory_t Category() const { return m_category; }
    /// Bytes of one value in memory; 0 for types of variable size.
    virtual size_t NativeSize() const { return 0; }
    /// Alignment of a value inside a record laid out as a C struct.
    virtual size_t Alignment() const { return 1; }
    /// True for strong references and arrays of them, whose values hold objects.
    virtual bool HoldsObjects() const { return false; }
    /// The interface face of this type, without a reference.
    virtual IAAFTypeDef* Interface() = 0;

    /// A present but empty value: zeroes for fixed sizes, nothing otherwise.
    Value EmptyValue();
    /// The value behind a caller's property value; throws AAFRESULT_NULL_PARAM
    /// for null or foreign ones and AAFRESULT_BAD_TYPE when it is of another type.
    Value& ValueOf(IAAFPropertyValue* pValue);
    /// A new free property value of this type, with one reference for the caller.
    IAAFPropertyValue* NewValue(Value value);

private:
    eAAFTypeCategory_t m_category;
};

}  // namespace aafmodel
