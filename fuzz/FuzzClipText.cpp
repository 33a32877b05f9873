// libFuzzer target: the texts that the clip model and the grouping read from
// files and file names: frame-rate keywords, timecodes, UIDs, numbered
// suffixes and TRK keys.
#include <cstdint>
#include <stdexcept>
#include <string>

#include "FuzzHost.h"
#include "clipmodel/FrameRateTable.h"
#include "clipmodel/TextForms.h"
#include "clipmodel/TextHelpers.h"
#include "grouping/TrackIndexFromFileName.h"
#include "grouping/TrkComparsion.h"

extern "C" int LLVMFuzzerInitialize(int*, char***) {
    StartFuzzHost();
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
    const std::string text(reinterpret_cast<const char*>(data), size);
    // Any answer is fine; only a crash, a leak or a hang is a fault.
    _aafRational_t rate{};
    bool drop = false;
    HelperFunctions::StringToFrameRate(text, rate, drop);
    int index = 0;
    VTImportGrouping::TrackIndexFromFileName(text, index);
    HelperFunctions::IsKeywordTRK(text);
    HelperFunctions::TrimFromBeginningAndEnd(text, ' ');
    HelperFunctions::GetFullFileNameFromPath(text);

    // Two keys, split at the first line break.
    const size_t split = text.find('\n');
    try {
        HelperFunctions::TrkComparsion(text.substr(0, split), split == std::string::npos ? "" : text.substr(split + 1));
    } catch (const std::out_of_range&) {
        // A key shorter than three characters.
    }

    // The string forms read text up to its first zero byte.
    try {
        const ZEB::ZEBString string(reinterpret_cast<const unsigned char*>(text.c_str()));
        unsigned short fps = 0;
        bool interlaced = false;
        HelperFunctions::StringToFrameRate(string, &fps, &interlaced);
        OrloReader::StringToTimecode(string);
        OrloReader::StringToUID(string);
    } catch (int) {
        // The host's string refused the bytes.
    }
    return 0;
}
