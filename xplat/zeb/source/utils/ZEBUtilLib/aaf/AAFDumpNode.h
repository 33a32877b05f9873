#pragma once
/// One node of a dumped object tree: an object (its class and properties), a
/// record, a list, or a single value, as the dump read it from the file.
#include <string>
#include <utility>
#include <vector>

namespace ZEB {

struct AAFDumpNode {
    enum class Kind { Number, Text, Object, Record, List };

    Kind kind = Kind::Text;
    /// The value of a number or text, in UTF-8; the class name of an object.
    std::string value;
    /// Properties of an object, members of a record, in order.
    std::vector<std::pair<std::string, AAFDumpNode>> fields;
    /// Elements of a list.
    std::vector<AAFDumpNode> items;
};

}  // namespace ZEB
