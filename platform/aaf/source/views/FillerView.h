#pragma once
/// A filler.
#include "../core/ViewBase.h"
#include "aaf/IAAFFiller.h"

namespace aafmodel {

class FillerView final : public View<IAAFFiller> {
public:
    using View::View;

    AAFRESULT Initialize(IAAFDataDef* pDataDef, aafLength_t length) override;
};

}  // namespace aafmodel
