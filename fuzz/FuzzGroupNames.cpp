// libFuzzer target: the file names that the group scan reads. The input is a
// given name and a folder entry's name, split at the first line break; both
// schemes' name readers and filters, the labels' layouts and the character
// count run on them.
#include <cstdint>
#include <stdexcept>
#include <string>
#include <string_view>

#include "FuzzHost.h"
#include "grouping/GetFileExtension.h"
#include "grouping/TesselFilter.h"
#include "grouping/TesselGrouping.h"
#include "grouping/TrackIndexFromFileName.h"
#include "grouping/UTF8Name.h"
#include "grouping/VTImportFilter.h"
#include "grouping/VTImportGrouping.h"

namespace {

// A filter made from `given` tried on both names; a name it cannot be made
// from throws std::logic_error, as it does in a scan.
template <class Filter>
void TryFilter(const ZEB::ZEBString& given, std::string_view givenBytes, std::string_view entry) {
    try {
        const Filter filter(given);
        filter(givenBytes);
        filter(entry);
    } catch (const std::logic_error&) {
    }
}

}  // namespace

extern "C" int LLVMFuzzerInitialize(int*, char***) {
    StartFuzzHost();
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
    const std::string text(reinterpret_cast<const char*>(data), size);
    const size_t split = text.find('\n');
    const std::string givenBytes = text.substr(0, split);
    const std::string entry = split == std::string::npos ? "" : text.substr(split + 1);
    // Any answer is fine; only a crash, a leak or a hang is a fault.
    Grouping::CountUTF8Characters(entry);
    int index = 0;
    VTImportGrouping::TrackIndexFromFileName(entry, index);
    try {
        // Names reach the readers as host strings, up to their first zero byte.
        const ZEB::ZEBString given = Grouping::NameText(givenBytes);
        TryFilter<VTImportGrouping::VTImportFilter>(given, givenBytes, entry);
        TryFilter<TesselGrouping::TesselFilter>(given, givenBytes, entry);
        ZEB::ZEBString out;
        VTImportGrouping::GetPreIndexFileName(given, out);
        TesselGrouping::GetPreIndexFileName(given, out);
        HelperFunctions::GetFileExtension(given);
        if (TesselGrouping::GetChannelLabel(given, out)) {
            const TesselGrouping::TesselGroupingInfo info;
            for (const auto& set : info.GetSizesOfChannelSets()) info.GetLabelIndex(set.first, out);
        }
    } catch (int) {
        // The host's string refused the bytes.
    }
    return 0;
}
