#pragma once
/// The dump of the AAF toolkit: any file's object tree, from the header,
/// walked through the published generic interfaces alone, so that dynamic
/// properties appear like built-in ones.
#include <ostream>

#include "aaf/AAF.h"

namespace ZEB {

struct AAFDumpOptions {
    enum class Format { Text, JSON };
    Format format = Format::Text;
    /// Leaves out every time stamp (creation, modification and file dates),
    /// so that dumps of the same content compare equal.
    bool omitClock = false;
};

/// Writes the tree of `file` to `out`. Returns a failure of the library, or
/// AAFRESULT_NULL_PARAM for a null file; what was written stays written.
AAFRESULT dumpAAF(IAAFFile* file, std::ostream& out, const AAFDumpOptions& options = {});
/// Writes the tree below any object.
AAFRESULT dumpAAF(IAAFObject* root, std::ostream& out, const AAFDumpOptions& options = {});

}  // namespace ZEB
