#include "identity/CreateUIDGenerator.h"

#include "startup/ZEBUtilLib.h"

namespace ZEB {

TOVRESULT CreateUIDGenerator(TOVPtr<ITOVUIDGeneratorMD5>& generator) {
    return ZEBUtilLib::gpComponentFactory->CreateComponent(TOVCompID_UIDGenerator, nullptr, IID_ITOVUIDGeneratorMD5,
                                                           generator.Out());
}

}  // namespace ZEB
