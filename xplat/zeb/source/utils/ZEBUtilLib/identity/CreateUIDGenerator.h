#pragma once
/// The host's content identifier generator, made through the library's
/// component factory.
#include "tov/ITOVUIDGeneratorMD5.h"
#include "tov/sdk/TOVPtr.h"

namespace ZEB {

/// Creates `TOVCompID_UIDGenerator` into `generator` and returns the factory's
/// result; a success may still leave `generator` empty. The library must be
/// started (the caller tests the factory).
TOVRESULT CreateUIDGenerator(TOVPtr<ITOVUIDGeneratorMD5>& generator);

}  // namespace ZEB
