#pragma once
/// The clip's identity, derived from the file each time it is linked so that
/// the host recognises a file it has seen before.
#include <string>
#include <vector>

#include "aaf/AAFTypes.h"
#include "reader/BEXTChunk.h"
#include "reader/UMIDChunk.h"
#include "reader/ixml/IXMLData.h"
#include "strings/ZEBString.h"

namespace OrloReader {

/// The Mob ID from, in this order: the iXML FILE_UID (when its toggle is on),
/// the `bext` UMID, the `umid` chunk, a digest of the file's samples and name.
/// Throws TOV_E_NOTSUPPORTED when even the digest cannot be made.
_aafMobID_t MobIDFromMetadata(const Chunks::BEXT::BEXTChunk* bext, bool hasBext, const Chunks::IXML::IXMLData& ixml,
                              bool hasIxml, const Chunks::UMID::UMIDChunk* umid, bool hasUmid,
                              const ZEB::ZEBString& path);

/// A digest of GetBufferForHash's bytes through the host's UID generator.
bool GenerateUIDFromFile(ZEB::ZEBString path, _aafUID_t& uid);

/// The first, middle and last block of the file and its name, so that the
/// identity does not depend on the folder and reading stays cheap. False and
/// an empty buffer on any failure.
bool GetBufferForHash(const std::string& path, std::vector<unsigned char>& buffer);

/// All of Data1, Data2, Data3 and Data4 not zero.
bool IsMobIdMaterialValid(_aafUID_t material);

}  // namespace OrloReader
