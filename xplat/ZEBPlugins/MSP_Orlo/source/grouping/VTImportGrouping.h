#pragma once
/// The numbered-suffix scheme, tried first: Take7_1.wav, Take7_2.wav, ...
/// where the number after the prefix's last delimiter is the channel.
#include <memory>
#include <vector>

#include "aaf/AAFTypes.h"
#include "clipmodel/Movie.h"
#include "clipmodel/Track.h"
#include "strings/ZEBString.h"
#include "tov/ITOVComponentFactory.h"

namespace VTImportGrouping {

/// True and the name up to and including its last delimiter (which may stand
/// behind the last dot); false for an empty name, one without a dot or one
/// without a delimiter.
bool GetPreIndexFileName(ZEB::ZEBString name, ZEB::ZEBString& prefix);

/// True when `a`'s channel index is less than `b`'s.
bool VTImportIndexComparator(std::shared_ptr<OrloReader::Track> a, std::shared_ptr<OrloReader::Track> b);

/// Gathers the one-channel files beside `path` whose names differ from its
/// only in a channel number of one or two characters into `tracks`, ordered
/// by number (members of equal number in no defined order). `groupLength`
/// comes in as the given file's sample count and leaves as the longest
/// member's. On success `*mobID` (which must not be null) becomes the group's
/// identity, the label part from the member of the lowest number. `rate` is
/// not used. False when no group of two files forms; whatever was gathered
/// then stays in `tracks` and the Movie keeps the metadata fed to it.
bool GroupInVTImportWay(ZEB::ZEBString path, std::vector<std::shared_ptr<OrloReader::Track>>& tracks,
                        _aafRational_t rate, long long& groupLength, _aafMobID_t* mobID, ITOVComponentFactory* factory,
                        OrloReader::Movie& movie);

}  // namespace VTImportGrouping
