#pragma once
/// Fills a new schema with the built-in classes, types, properties and data
/// definitions, and names the interface views of each class.
namespace aafmodel {

class Schema;

void BuildBuiltinSchema(Schema& schema);

}  // namespace aafmodel
