#pragma once
/// Reads an AAF object tree into dump nodes through IAAFObject, IAAFProperty,
/// IAAFPropertyValue and the type definition interfaces.
#include "AAFDumpNode.h"
#include "aaf/AAF.h"

namespace ZEB {

class AAFTreeReader {
public:
    explicit AAFTreeReader(bool omitClock) : m_omitClock(omitClock) {}

    /// The node of `object` with all that lies below it; throws a failing AAFRESULT as an int.
    AAFDumpNode ReadObject(IAAFObject* object);

private:
    AAFDumpNode ReadValue(IAAFTypeDef* type, IAAFPropertyValue* value);
    AAFDumpNode ReadRecord(IAAFTypeDef* type, IAAFPropertyValue* value);
    AAFDumpNode ReadArray(IAAFTypeDef* type, IAAFPropertyValue* value);

    bool m_omitClock;
};

}  // namespace ZEB
