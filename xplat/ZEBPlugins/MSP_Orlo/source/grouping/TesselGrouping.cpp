#include "grouping/TesselGrouping.h"

#include <algorithm>
#include <string>

#include "grouping/GroupIdentity.h"
#include "grouping/GroupScan.h"
#include "grouping/ListAllFilesInFolder.h"
#include "grouping/TesselFilter.h"
#include "grouping/UTF8Name.h"

namespace TesselGrouping {

namespace {

using SetSize = std::pair<TesselGroupingInfo::CHANNEL_SET, unsigned char>;

// The positions of the name's last two dots; false when it has fewer.
bool LastTwoDots(const std::string& text, size_t& previous, size_t& last) {
    last = text.rfind('.');
    if (last == std::string::npos || last == 0) return false;
    previous = text.rfind('.', last - 1);
    return previous != std::string::npos;
}

}  // namespace

bool GetPreIndexFileName(ZEB::ZEBString name, ZEB::ZEBString& prefix) {
    if (name.IsEmpty()) return false;
    const std::string text = Grouping::UTF8Name(name);
    size_t previous, last;
    if (!LastTwoDots(text, previous, last)) return false;
    prefix = Grouping::NameText(text.substr(0, previous));
    return true;
}

bool GetChannelLabel(ZEB::ZEBString name, ZEB::ZEBString& label) {
    if (name.IsEmpty()) return false;
    const std::string text = Grouping::UTF8Name(name);
    size_t previous, last;
    if (!LastTwoDots(text, previous, last)) return false;
    label = Grouping::NameText(text.substr(previous, last - previous));
    label.ConvertTo(name.GetUnicodeType());
    return true;
}

bool CompareSetsOfChannelsBySize(const SetSize& a, const SetSize& b) { return a.second >= b.second; }

bool TesselIndexComparator(std::shared_ptr<OrloReader::Track> a, std::shared_ptr<OrloReader::Track> b) {
    return a->GetChannelIndex() < b->GetChannelIndex();
}

bool InitTrackIndexesFromFilesSet(std::vector<std::shared_ptr<OrloReader::Track>>& tracks,
                                  std::vector<ZEB::ZEBString> labels, ZEB::ZEBString ownLabel,
                                  TesselGroupingInfo info) {
    std::vector<SetSize> sets;
    for (const auto& set : info.GetSizesOfChannelSets())
        if (set.second <= tracks.size()) sets.push_back(set);
    // The sizes differ from each other, so the comparison orders them strictly.
    std::sort(sets.begin(), sets.end(), CompareSetsOfChannelsBySize);
    const auto chosen = std::find_if(sets.begin(), sets.end(), [&](const SetSize& set) {
        return info.IsASetOfChannels(set.first, labels) && info.GetLabelIndex(set.first, ownLabel) != 0;
    });
    if (chosen == sets.end()) return false;

    // Walked in step; a label outside the layout takes its track out with it.
    for (size_t i = 0; i < tracks.size() && i < labels.size();) {
        const unsigned char channel = info.GetLabelIndex(chosen->first, labels[i]);
        if (channel != 0) {
            tracks[i++]->SetChannelIndex(channel);
        } else {
            tracks.erase(tracks.begin() + static_cast<long>(i));
            labels.erase(labels.begin() + static_cast<long>(i));
        }
    }
    std::sort(tracks.begin(), tracks.end(), TesselIndexComparator);
    return true;
}

bool GroupInTesselWay(ZEB::ZEBString path, std::vector<std::shared_ptr<OrloReader::Track>>& tracks, _aafRational_t,
                      long long& groupLength, _aafMobID_t* mobID, ITOVComponentFactory* factory,
                      OrloReader::Movie& movie) {
    return GroupingFunctions::RunGroupingScheme(
        path, mobID, [&](const ZEB::ZEBString& folder, const ZEB::ZEBString& name, _aafMobID_t& base) {
            const TesselFilter filter(name);
            const TesselGroupingInfo info;
            ZEB::ZEBString ownLabel;
            if (!GetChannelLabel(name, ownLabel)) return false;
            std::vector<ZEB::ZEBString> names;
            if (!HelperFunctions::ListAllFilesInFolder(folder, names, filter)) return false;
            Grouping::GroupIdentity identity;
            if (!identity.Open()) return false;

            std::vector<ZEB::ZEBString> labels;
            ZEB::ZEBString baseLabel;
            for (const ZEB::ZEBString& member : names) {
                ZEB::ZEBString label;
                if (!GetChannelLabel(member, label)) continue;
                _aafMobID_t memberID{};
                if (!GroupingFunctions::AddGroupMember(folder, member, 0, groupLength, factory, movie, tracks,
                                                       memberID))
                    continue;
                // The label that sorts last, letter case counting, gives the base.
                if (baseLabel.IsEmpty() || baseLabel < label) {
                    base = memberID;
                    baseLabel = label;
                }
                labels.push_back(label);
            }
            if (tracks.size() < 2) return false;
            if (!InitTrackIndexesFromFilesSet(tracks, labels, ownLabel, info)) return false;
            return identity.Write(tracks, base);
        });
}

}  // namespace TesselGrouping
