#include "TypeDefinition.h"

#include "Guard.h"
#include "InternalIDs.h"
#include "PropertyValue.h"
#include "Schema.h"

namespace aafmodel {

TypeDefinition::TypeDefinition(Schema& schema, const aafUID_t& id, std::wstring name, eAAFTypeCategory_t category)
    : MetaDefinitionBase(schema, id, std::move(name)), m_category(category) {}

Value TypeDefinition::EmptyValue() {
    Value value;
    value.type = this;
    value.data.assign(NativeSize(), 0);
    return value;
}

Value& TypeDefinition::ValueOf(IAAFPropertyValue* pValue) {
    PropertyValue* value = Borrow<PropertyValue>(pValue, kInternal_PropertyValue);
    Require(value);
    Value& v = value->Get();
    if (v.type != this) throw static_cast<int>(AAFRESULT_BAD_TYPE);
    // The caller may write through it into an object's property.
    m_schema.NoteChange();
    return v;
}

IAAFPropertyValue* TypeDefinition::NewValue(Value value) {
    value.type = value.type ? value.type : this;
    value.owner = nullptr;
    return PropertyValue::Make(std::make_shared<Value>(std::move(value)));
}

}  // namespace aafmodel
