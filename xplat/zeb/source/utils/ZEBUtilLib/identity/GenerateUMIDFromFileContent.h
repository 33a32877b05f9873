#pragma once
/// A content identifier of a file, made by the host's UID generator over at
/// most three blocks of 4 MiB, so that the cost stays bounded on large files.
#include "aaf/AAFTypes.h"
#include "tov/ITOVString.h"
#include "tov/TOVResult.h"

namespace ZEB {

/// Digests the first block, the middle block of a file above 8 MiB and the
/// last block of a file above 4 MiB; nothing but content enters the digest.
/// TOV_E_INVALIDARG for a null or empty `path` or a null `out`; ZEB_E_NOTREADY
/// before the library is started; TOV_E_FILEOPEN for a file that cannot be
/// opened; TOV_E_UNEXPECTED when the generator cannot be made. Otherwise the
/// first failing result of the generator, or that of its Finish. `*out` is
/// cleared before the file is opened.
TOVRESULT GenerateUMIDFromFileContent(ITOVString* path, _aafUID_t* out);

}  // namespace ZEB
