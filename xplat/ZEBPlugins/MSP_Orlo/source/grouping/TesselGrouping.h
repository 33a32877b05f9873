#pragma once
/// The channel-label scheme, tried second: Mix.L.wav, Mix.R.wav, Mix.C.wav,
/// where the labels make up a known layout that gives each its channel.
#include <memory>
#include <utility>
#include <vector>

#include "aaf/AAFTypes.h"
#include "clipmodel/Movie.h"
#include "clipmodel/Track.h"
#include "grouping/TesselGroupingInfo.h"
#include "strings/ZEBString.h"
#include "tov/ITOVComponentFactory.h"

namespace TesselGrouping {

/// True and the name before its next-to-last dot (Mix for Mix.L.wav); false
/// for an empty name or one with fewer than two dots.
bool GetPreIndexFileName(ZEB::ZEBString name, ZEB::ZEBString& prefix);

/// True and the text from the name's next-to-last dot to its last (".L" for
/// Mix.L.wav), in the name's encoding; false for an empty name or one with
/// fewer than two dots.
bool GetChannelLabel(ZEB::ZEBString name, ZEB::ZEBString& label);

/// Gives each track the channel of its label, in step with `labels`, in the
/// largest layout that the labels make up in full and that holds
/// `ownLabel`; tracks whose label is not in that layout leave the group with
/// their labels. Then orders the tracks by channel. False, with the tracks as
/// they were, when no layout qualifies.
bool InitTrackIndexesFromFilesSet(std::vector<std::shared_ptr<OrloReader::Track>>& tracks,
                                  std::vector<ZEB::ZEBString> labels, ZEB::ZEBString ownLabel, TesselGroupingInfo info);

/// True when the first set's size is greater than or equal to the second's:
/// the largest set sorts first.
bool CompareSetsOfChannelsBySize(const std::pair<TesselGroupingInfo::CHANNEL_SET, unsigned char>& a,
                                 const std::pair<TesselGroupingInfo::CHANNEL_SET, unsigned char>& b);

/// True when `a`'s channel index is less than `b`'s.
bool TesselIndexComparator(std::shared_ptr<OrloReader::Track> a, std::shared_ptr<OrloReader::Track> b);

/// As VTImportGrouping::GroupInVTImportWay, for files whose names differ from
/// `path`'s in a channel label of at most four characters; the label part of
/// the group's identity comes from the member whose label sorts last. The
/// tracks already in `tracks` are kept and walked with the labels of this
/// scheme's members, so that leftovers of a failed first scheme throw the two
/// out of step.
bool GroupInTesselWay(ZEB::ZEBString path, std::vector<std::shared_ptr<OrloReader::Track>>& tracks, _aafRational_t rate,
                      long long& groupLength, _aafMobID_t* mobID, ITOVComponentFactory* factory,
                      OrloReader::Movie& movie);

}  // namespace TesselGrouping
