#include "grouping/TesselGroupingInfo.h"

#include <algorithm>
#include <initializer_list>

#include "grouping/AreZEBStringsEqual.h"
#include "grouping/UTF8Name.h"

namespace TesselGrouping {

namespace {

// Labels are compared with letter case ignored.
constexpr int kIgnoreCase = 0;

std::vector<ZEB::ZEBString> Labels(std::initializer_list<const char*> texts) {
    std::vector<ZEB::ZEBString> labels;
    for (const char* text : texts) labels.push_back(Grouping::NameText(text));
    return labels;
}

}  // namespace

TesselGroupingInfo::TesselGroupingInfo() {
    InitChannelsToLabelsMap();
    InitSizesOfChannelSetsMap();
}

void TesselGroupingInfo::InitChannelsToLabelsMap() {
    channelsToLabels[CHANNEL_SET_STEREO] = Labels({".L", ".R"});
    channelsToLabels[CHANNEL_SET_LCR] = Labels({".L", ".C", ".R"});
    channelsToLabels[CHANNEL_SET_51] = Labels({".L", ".C", ".R", ".Ls", ".Rs", ".LFE"});
    channelsToLabels[CHANNEL_SET_71] = Labels({".L", ".C", ".R", ".Lss", ".Rss", ".Lsr", ".Rsr", ".LFE"});
}

void TesselGroupingInfo::InitSizesOfChannelSetsMap() {
    sizesOfChannelSets[CHANNEL_SET_STEREO] = 2;
    sizesOfChannelSets[CHANNEL_SET_LCR] = 3;
    sizesOfChannelSets[CHANNEL_SET_51] = 6;
    sizesOfChannelSets[CHANNEL_SET_71] = 8;
}

unsigned char TesselGroupingInfo::GetLabelIndex(CHANNEL_SET set, const ZEB::ZEBString& label) const {
    if (label.IsEmpty()) return 0;
    const std::vector<ZEB::ZEBString>& labels = channelsToLabels.at(set);
    for (size_t i = 0; i < labels.size(); ++i)
        if (HelperFunctions::AreZEBStringsEqual(labels[i], label, kIgnoreCase))
            return static_cast<unsigned char>(i + 1);
    return 0;
}

bool TesselGroupingInfo::IsASetOfChannels(CHANNEL_SET set, const std::vector<ZEB::ZEBString>& labels) const {
    const std::vector<ZEB::ZEBString>& wanted = channelsToLabels.at(set);
    if (labels.empty() || wanted.size() > labels.size()) return false;
    const auto found = std::count_if(wanted.begin(), wanted.end(), [&](const ZEB::ZEBString& label) {
        return std::any_of(labels.begin(), labels.end(), [&](const ZEB::ZEBString& other) {
            return HelperFunctions::AreZEBStringsEqual(label, other, kIgnoreCase);
        });
    });
    return found == sizesOfChannelSets.at(set);
}

}  // namespace TesselGrouping
