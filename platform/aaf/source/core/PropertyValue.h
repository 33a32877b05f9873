#pragma once
/// A typed value handed to callers. A value read from an object's property
/// shares that property's storage, so changes made through the type
/// interfaces (AppendElement, SetStruct, ...) land in the object; a value
/// made by a type is free until SetPropertyValue copies it in.
#include <memory>

#include "RefPtr.h"
#include "Value.h"
#include "aaf/IAAFPropertyValue.h"

namespace aafmodel {

class Schema;

class PropertyValue final : public IAAFPropertyValue {
public:
    /// A new value with one reference for the caller.
    static IAAFPropertyValue* Make(std::shared_ptr<Value> value);

    Value& Get() const { return *m_value; }

    AAFRESULT QueryInterface(REFIID riid, void** ppvObj) override;
    aafUInt32 AddRef() override { return ++m_refs; }
    aafUInt32 Release() override;

    AAFRESULT GetType(IAAFTypeDef** ppTypeDef) override;
    AAFRESULT IsDefinedType(aafBool* pIsDefined) override;

private:
    PropertyValue(std::shared_ptr<Value> value, Schema& schema);
    ~PropertyValue() = default;

    aafUInt32 m_refs = 0;
    RefPtr<Schema> m_schema;
    std::shared_ptr<Value> m_value;
};

}  // namespace aafmodel
