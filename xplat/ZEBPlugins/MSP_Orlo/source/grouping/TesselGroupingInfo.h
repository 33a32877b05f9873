#pragma once
/// The channel layouts that a channel-label group may make up, each with its
/// labels in channel order.
#include <map>
#include <vector>

#include "strings/ZEBString.h"

namespace TesselGrouping {

class TesselGroupingInfo {
public:
    enum CHANNEL_SET { CHANNEL_SET_STEREO = 0, CHANNEL_SET_LCR = 1, CHANNEL_SET_51 = 2, CHANNEL_SET_71 = 3 };

    /// Fills the two tables.
    TesselGroupingInfo();

    /// The label's channel in `set`, counted from 1, letter case ignored; 0
    /// for an empty label or one that is not in the set.
    unsigned char GetLabelIndex(CHANNEL_SET set, const ZEB::ZEBString& label) const;
    /// True when every label of `set` is among `labels`, which may hold
    /// others besides: a full 7.1 layout also holds a stereo one.
    bool IsASetOfChannels(CHANNEL_SET set, const std::vector<ZEB::ZEBString>& labels) const;

    const std::map<CHANNEL_SET, unsigned char>& GetSizesOfChannelSets() const { return sizesOfChannelSets; }

private:
    void InitChannelsToLabelsMap();
    void InitSizesOfChannelSetsMap();

    std::map<CHANNEL_SET, std::vector<ZEB::ZEBString>> channelsToLabels;
    std::map<CHANNEL_SET, unsigned char> sizesOfChannelSets;
};

}  // namespace TesselGrouping
