#pragma once
/// The group scan: the sibling one-channel files of one recording, found in
/// the given file's folder by numbered suffix or else by channel label.
#include <memory>
#include <vector>

#include "aaf/AAFTypes.h"
#include "clipmodel/Movie.h"
#include "clipmodel/Track.h"
#include "strings/ZEBString.h"
#include "tov/ITOVComponentFactory.h"

namespace GroupingFunctions {

/// Tries the numbered-suffix scheme, then the channel-label scheme, with the
/// arguments of VTImportGrouping::GroupInVTImportWay. Nothing is undone
/// between the two: tracks the first gathered and the length it raised stay
/// for the second. True when either made a group. Never reports: a file
/// without a group is simply taken alone.
bool FindAndParseFilesForGrouping(ZEB::ZEBString path, std::vector<std::shared_ptr<OrloReader::Track>>& tracks,
                                  _aafRational_t rate, long long& groupLength, _aafMobID_t* mobID,
                                  ITOVComponentFactory* factory, OrloReader::Movie& movie);

}  // namespace GroupingFunctions
