#pragma once
/// The start, rate and drop flag of a timecode segment.
#include "../core/ViewBase.h"
#include "aaf/IAAFTimecode.h"

namespace aafmodel {

class TimecodeView final : public View<IAAFTimecode> {
public:
    using View::View;

    AAFRESULT Initialize(aafLength_t length, aafTimecode_t* pTimecode) override;
    AAFRESULT GetTimecode(aafTimecode_t* pTimecode) override;
    AAFRESULT SetTimecode(aafTimecode_t* pTimecode) override;
};

}  // namespace aafmodel
