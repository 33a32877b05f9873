#pragma once
/// The rules that settle each production attribute of a Movie from the iXML
/// document, the `bext` Description keywords and the file itself, each in its
/// own order of trust. Text taken from iXML is UTF-8.
#include <string>

#include "clipmodel/Movie.h"
#include "reader/BEXTChunk.h"
#include "reader/ixml/IXMLData.h"
#include "strings/ZEBString.h"

namespace OrloReader {

using Chunks::BEXT::BEXTChunk;
using Chunks::IXML::IXMLData;

void AddSceneFromMetadata(const BEXTChunk* bext, bool hasBext, const IXMLData& ixml, bool hasIxml, Movie& movie);
void AddTakeFromMetadata(const BEXTChunk* bext, bool hasBext, const IXMLData& ixml, bool hasIxml, Movie& movie);
/// Date and time from `bext`, each part on its own; what is missing comes from
/// the file's creation time.
void AddShootDateFromMetadata(const BEXTChunk* bext, bool hasBext, ZEB::ZEBString path, Movie& movie);
/// Scene and take as "scene/take"; the file name when neither is known.
void AddMovieNameFromMetadata(const std::string& fileName, Movie& movie);
void AddUBITSFromMetadata(const BEXTChunk* bext, bool hasBext, const IXMLData& ixml, bool hasIxml, Movie& movie);
/// `makeTapeFromFile` allows the last resort: the file name and the `bext` date.
void AddTapeFromMetadata(const BEXTChunk* bext, bool hasBext, const IXMLData& ixml, bool hasIxml,
                         const std::string& fileName, bool makeTapeFromFile, Movie& movie);
void AddCommentsFromMetadata(const BEXTChunk* bext, bool hasBext, const IXMLData& ixml, bool hasIxml, Movie& movie);
void AddUserCommentsFromMetadata(const IXMLData& ixml, bool hasIxml, Movie& movie);
void AddProjectFromMetadata(const IXMLData& ixml, bool hasIxml, Movie& movie);
void AddCircledFromMetadata(const BEXTChunk* bext, bool hasBext, const IXMLData& ixml, bool hasIxml, Movie& movie);
void AddWildTrackFromMetadata(const IXMLData& ixml, bool hasIxml, Movie& movie);
void AddFalseStartFromMetadata(const IXMLData& ixml, bool hasIxml, Movie& movie);
void AddNoGoodFromMetadata(const IXMLData& ixml, bool hasIxml, Movie& movie);
void AddDigitazerRateFromMetadata(const IXMLData& ixml, bool hasIxml, double sampleRate, Movie& movie);

}  // namespace OrloReader
