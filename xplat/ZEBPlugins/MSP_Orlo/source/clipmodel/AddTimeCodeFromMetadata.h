#pragma once
/// The clip's frame rate and start timecode, decided from what the file says
/// in a fixed order of trust, and the clip's timecode track.
#include "aaf/AAFTypes.h"
#include "clipmodel/Movie.h"
#include "reader/BEXTChunk.h"
#include "reader/ixml/IXMLData.h"
#include "reader/ixml/IXMLSpeed.h"
#include "strings/ZEBString.h"
#include "tov/ITOVComponentFactory.h"

namespace OrloReader {

/// Sets the edit rate, both frame rates, the start offset and the time codes,
/// and appends the timecode track; reports the decision on the host's console.
/// Throws TOV_E_POINTER when the iXML and `bext` start times disagree and
/// there is no console to say so. `sampleCount` is not used.
void AddTimeCodeFromMetadata(const Chunks::BEXT::BEXTChunk* bext, bool hasBext, const Chunks::IXML::IXMLData& ixml,
                             bool hasIxml, double sampleRate, long long sampleCount, ZEB::ZEBString path, Movie& movie,
                             ITOVComponentFactory* factory);

/// The frame rate that iXML's SPEED or the `bext` keywords FRAMERATE and SPEED
/// give, in that order; false when none does. `speed`, `bext` and `source`
/// may be null; `source` gets the name of where the rate came from.
bool ChooseFrameRateFromFileAttributes(const Chunks::IXML::IXMLSpeed* speed, const Chunks::BEXT::BEXTChunk* bext,
                                       bool useDropFlag, _aafRational_t& rate, bool& drop, const char** source);

}  // namespace OrloReader
