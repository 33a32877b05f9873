#include "grouping/FindAndParseFilesForGrouping.h"

#include "grouping/TesselGrouping.h"
#include "grouping/VTImportGrouping.h"

namespace GroupingFunctions {

bool FindAndParseFilesForGrouping(ZEB::ZEBString path, std::vector<std::shared_ptr<OrloReader::Track>>& tracks,
                                  _aafRational_t rate, long long& groupLength, _aafMobID_t* mobID,
                                  ITOVComponentFactory* factory, OrloReader::Movie& movie) {
    if (VTImportGrouping::GroupInVTImportWay(path, tracks, rate, groupLength, mobID, factory, movie)) return true;
    return TesselGrouping::GroupInTesselWay(path, tracks, rate, groupLength, mobID, factory, movie);
}

}  // namespace GroupingFunctions
