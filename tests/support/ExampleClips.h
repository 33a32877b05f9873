#pragma once
/// The worked examples of the clip builder, built by hand with the AAF
/// operations in the builder's order, through whatever entry point is given
/// (the loader's forwarder, as the plug-in does). A failing operation throws
/// std::runtime_error naming it.
#include <vector>

#include "aaf/AAF.h"

namespace aaftest {

/// A stereo file with one timecode track: tape Mob with "TC1", A1, A2; file
/// Mob slot 2 with mono slots 2 and 3; Master slots A1 and A2 on channels 1
/// and 2; PCM and import descriptors with locators; two comments.
IAAFFile* BuildStereoClip();
/// A group of mono files with the given channel indices (sorted), one file
/// Source Mob each, the tape numbered up to the highest channel.
IAAFFile* BuildGroupedClip(const std::vector<aafUInt32>& channels);
/// The volume route's clip, in the metadata handler's order: Master Mob with
/// slots A1 and A2 made by AddMasterSlot, a comment, three memos as
/// descriptive markers on event slot 1001, head frame attributes and bitmap;
/// a source Mob with a multiple descriptor of two PCM descriptors; a SFILE
/// Mob with "TC1", two nil-reference slots and an import descriptor with one
/// locator per track.
IAAFFile* BuildMetadataClip();

}  // namespace aaftest
