#pragma once
/// Reading a dynamic toggle where the clip model's behaviour depends on one.

namespace OrloReader {

/// True when the toggle at `path` reads as not zero through the module's
/// factory. A toggle that cannot be read, for whatever reason, is off.
bool IsToggleOn(const char* path);

}  // namespace OrloReader
