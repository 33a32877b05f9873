#pragma once
/// The record behind the opaque handle of GenerateUMIDFromData_Begin.
#include "tov/ITOVUIDGeneratorMD5.h"

namespace ZEB {

/// Made by GenerateUMIDFromData_Begin with `new`, freed by
/// GenerateUMIDFromData_Finish. Holds one reference to the generator (null
/// when its creation failed) and the generator's digest context.
struct UMIDDigest {
    ITOVUIDGeneratorMD5* generator;
    void* context;
};

}  // namespace ZEB
