#pragma once
/// A content identifier over data fed piece by piece, made by the host's UID
/// generator. The handle is opaque to the caller (a `UMIDDigest` behind it).
#include "aaf/AAFTypes.h"
#include "tov/TOVResult.h"

namespace ZEB {

/// Starts a digest and stores its handle in `*digestHandle`. TOV_E_INVALIDARG
/// for a null `digestHandle`, ZEB_E_NOTREADY before the library is started.
/// When the generator cannot be made the result is TOV_E_UNEXPECTED and the
/// handle stays set, holding no generator; otherwise the generator's Begin result.
TOVRESULT GenerateUMIDFromData_Begin(void** digestHandle);
/// Feeds `count` bytes. TOV_E_INVALIDARG for a null handle, a count of 0 or
/// null `data`; TOV_E_UNEXPECTED for a handle holding no generator.
TOVRESULT GenerateUMIDFromData_AddData(void** digestHandle, unsigned int count, unsigned char* data);
/// Writes the 16 bytes into `*out`, frees the handle and sets it to null;
/// returns the generator's result. TOV_E_INVALIDARG for a null handle or `out`;
/// a handle holding no generator gives TOV_E_UNEXPECTED and is not freed.
TOVRESULT GenerateUMIDFromData_Finish(void** digestHandle, _aafUID_t* out);

}  // namespace ZEB
