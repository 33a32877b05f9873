#pragma once
/// A clip's AAF file as the tool shows it: the AAF dump as text or JSON.
#include <string>

#include "aaf/AAF.h"
#include "tov/TOVResult.h"

/// Writes the dump of `file` into `out`; `noClock` leaves out the values that
/// carry the clock. Says on stderr when the file cannot be read back.
TOVRESULT DumpClip(IAAFFile* file, bool json, bool noClock, std::string& out);
