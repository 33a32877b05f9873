#include "grouping/VTImportFilter.h"

#include "grouping/VTImportGrouping.h"

namespace VTImportGrouping {

namespace {

// Fewer than three characters between prefix and extension.
constexpr uint32_t kVariableLimit = 3;

}  // namespace

VTImportFilter::VTImportFilter(const ZEB::ZEBString& name)
    : GroupNameFilter(name, &GetPreIndexFileName, kVariableLimit) {}

}  // namespace VTImportGrouping
