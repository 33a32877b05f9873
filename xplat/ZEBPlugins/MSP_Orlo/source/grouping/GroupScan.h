#pragma once
/// What the two grouping schemes share: the split of the given path, and the
/// intake of one member file into the group's tracks and the Movie.
#include <exception>
#include <memory>
#include <vector>

#include "aaf/AAFTypes.h"
#include "clipmodel/Movie.h"
#include "clipmodel/Track.h"
#include "strings/ZEBString.h"
#include "tov/ITOVComponentFactory.h"

namespace GroupingFunctions {

/// `folder` up to and including the path's last separator (empty when it has
/// none past its first character), `name` the rest of the path.
void SplitGroupPath(const ZEB::ZEBString& path, ZEB::ZEBString& folder, ZEB::ZEBString& name);

/// Runs one scheme: `gather(folder, name, base)` with the path split and the
/// Movie's identifier `*mobID` as the base, which it turns into the group's
/// identity and answers whether a group formed. Only a group writes
/// `*mobID`; a std::exception thrown inside ends the scheme with false.
template <class Gather>
bool RunGroupingScheme(const ZEB::ZEBString& path, _aafMobID_t* mobID, Gather gather) {
    try {
        _aafMobID_t base = *mobID;
        ZEB::ZEBString folder, name;
        SplitGroupPath(path, folder, name);
        if (!gather(folder, name, base)) return false;
        *mobID = base;
        return true;
    } catch (const std::exception&) {
        return false;
    }
}

/// Takes in `folder` + `name` as a member on `channelIndex`: raises
/// `groupLength` to its sample count, feeds its metadata to `movie` (track
/// names, comments and user comments always; every other attribute only while
/// the Movie has none), appends its track and gives its own Mob ID in
/// `memberID`. False, and nothing changed, for anything but a plain file
/// (which is not opened), and for a file that is not a readable one-channel
/// audio file or whose identity cannot be derived: such a file is passed
/// over, whatever stopped it.
bool AddGroupMember(const ZEB::ZEBString& folder, const ZEB::ZEBString& name, unsigned char channelIndex,
                    long long& groupLength, ITOVComponentFactory* factory, OrloReader::Movie& movie,
                    std::vector<std::shared_ptr<OrloReader::Track>>& tracks, _aafMobID_t& memberID);

}  // namespace GroupingFunctions
