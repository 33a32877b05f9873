#include "grouping/VTImportGrouping.h"

#include <algorithm>
#include <string>

#include "grouping/GroupIdentity.h"
#include "grouping/GroupScan.h"
#include "grouping/ListAllFilesInFolder.h"
#include "grouping/TrackIndexFromFileName.h"
#include "grouping/UTF8Name.h"
#include "grouping/VTImportFilter.h"

namespace VTImportGrouping {

namespace {

// Above every channel number, so that the first member read sets the base.
constexpr int kNoNumberYet = 0x7FFF;

}  // namespace

bool GetPreIndexFileName(ZEB::ZEBString name, ZEB::ZEBString& prefix) {
    if (name.IsEmpty()) return false;
    const std::string text = Grouping::UTF8Name(name);
    if (text.find('.') == std::string::npos) return false;
    const size_t delimiter = text.find_last_of(kDelimiters);
    if (delimiter == std::string::npos) return false;
    prefix = Grouping::NameText(text.substr(0, delimiter + 1));
    return true;
}

bool VTImportIndexComparator(std::shared_ptr<OrloReader::Track> a, std::shared_ptr<OrloReader::Track> b) {
    return a->GetChannelIndex() < b->GetChannelIndex();
}

bool GroupInVTImportWay(ZEB::ZEBString path, std::vector<std::shared_ptr<OrloReader::Track>>& tracks, _aafRational_t,
                        long long& groupLength, _aafMobID_t* mobID, ITOVComponentFactory* factory,
                        OrloReader::Movie& movie) {
    return GroupingFunctions::RunGroupingScheme(
        path, mobID, [&](const ZEB::ZEBString& folder, const ZEB::ZEBString& name, _aafMobID_t& base) {
            const VTImportFilter filter(name);
            Grouping::GroupIdentity identity;
            if (!identity.Open()) return false;
            std::vector<ZEB::ZEBString> names;
            if (!HelperFunctions::ListAllFilesInFolder(folder, names, filter)) return false;
            // The given file needs a number of its own, though its siblings may have one.
            int own = 0;
            if (!TrackIndexFromFileName(Grouping::UTF8Name(name), own)) return false;

            int smallest = kNoNumberYet;
            for (const ZEB::ZEBString& member : names) {
                int number = 0;
                if (!TrackIndexFromFileName(Grouping::UTF8Name(member), number)) continue;
                _aafMobID_t memberID{};
                if (!GroupingFunctions::AddGroupMember(folder, member, static_cast<unsigned char>(number), groupLength,
                                                       factory, movie, tracks, memberID))
                    continue;
                // Of equal numbers the first in listing order stays the base.
                if (number < smallest) {
                    base = memberID;
                    smallest = number;
                }
            }
            if (tracks.size() < 2) return false;
            // Not stable: of two members with one number, either may come first.
            std::sort(tracks.begin(), tracks.end(), VTImportIndexComparator);
            return identity.Write(tracks, base);
        });
}

}  // namespace VTImportGrouping
