#include "Value.h"

#include "ModelObject.h"

namespace aafmodel {

Value::Value() = default;
Value::~Value() = default;
Value::Value(const Value&) = default;
Value::Value(Value&&) noexcept = default;
Value& Value::operator=(const Value&) = default;
Value& Value::operator=(Value&&) noexcept = default;

}  // namespace aafmodel
