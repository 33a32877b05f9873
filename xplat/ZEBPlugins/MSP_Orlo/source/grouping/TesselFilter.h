#pragma once
/// The names of a channel-label group: Mix.L.wav, Mix.R.wav, Mix.Lss.wav.
#include "grouping/GroupNameFilter.h"

namespace TesselGrouping {

class TesselFilter : public Grouping::GroupNameFilter {
public:
    /// The base before the name's next-to-last dot, and its extension;
    /// between them the label, of at most four characters with its dot.
    /// Throws std::logic_error, with the other scheme's text, for a name with
    /// fewer than two dots.
    explicit TesselFilter(const ZEB::ZEBString& name);
};

}  // namespace TesselGrouping
