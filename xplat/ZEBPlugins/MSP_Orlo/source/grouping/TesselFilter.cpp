#include "grouping/TesselFilter.h"

#include "grouping/TesselGrouping.h"

namespace TesselGrouping {

namespace {

// Fewer than five characters between base and extension: room for ".Lss".
constexpr uint32_t kVariableLimit = 5;

}  // namespace

TesselFilter::TesselFilter(const ZEB::ZEBString& name) : GroupNameFilter(name, &GetPreIndexFileName, kVariableLimit) {}

}  // namespace TesselGrouping
