#pragma once
/// The names of a numbered-suffix group: Take7_1.wav, Take7_2.wav, Take7_12.wav.
#include "grouping/GroupNameFilter.h"

namespace VTImportGrouping {

class VTImportFilter : public Grouping::GroupNameFilter {
public:
    /// The prefix up to and including the name's last delimiter, and its
    /// extension; between them the channel number, of at most two characters.
    /// Throws std::logic_error for a name without a dot or a delimiter.
    explicit VTImportFilter(const ZEB::ZEBString& name);
};

}  // namespace VTImportGrouping
